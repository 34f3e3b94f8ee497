// VFnNumericAttribute: numeric attributes, their default and their range.
#include <openvorla/VFnNumericAttribute.h>

#include <cmath>

#include "AttributeSets.h"

OPENVORLA_NAMESPACE_OPEN

double attributes::numericValue(int numericType, double value) {
  switch (numericType) {
    case VFnNumericData::kBoolean:
      return value != 0.0 ? 1.0 : 0.0;
    case VFnNumericData::kByte:
    case VFnNumericData::kChar:
    case VFnNumericData::kShort:
    case VFnNumericData::kInt:
    case VFnNumericData::kInt64:
      return std::trunc(value);
    case VFnNumericData::kFloat:
      return static_cast<float>(value);
    default:
      return value;
  }
}

namespace {

using attributes::report;

VStatus notNumeric() { return VStatus(VStatus::kInvalidParameter, "The attribute is not numeric"); }

// The attached attribute's declaration, which must be numeric.
bool readNumeric(const VObject &attached, AttributeInfo *info, VStatus *ReturnStatus) {
  if (!attributes::read(attached, info, ReturnStatus)) return false;
  if (!info->dataType) return true;
  report(ReturnStatus, notNumeric());
  return false;
}

VStatus changeNumeric(const VObject &attached, const std::function<void(AttributeInfo &)> &f) {
  AttributeInfo info;
  VStatus status;
  if (!readNumeric(attached, &info, &status)) return status;
  return attributes::change(attached, f);
}

}  // namespace

VFnNumericAttribute::VFnNumericAttribute() = default;

VFnNumericAttribute::VFnNumericAttribute(const VObject &object, VStatus *ReturnStatus) {
  AttributeInfo info;
  if (!readNumeric(object, &info, nullptr)) {
    report(ReturnStatus,
           VStatus(VStatus::kInvalidParameter, "The object is not a numeric attribute"));
    return;
  }
  setObject(object);
  report(ReturnStatus, VStatus::kSuccess);
}

VFnNumericAttribute::~VFnNumericAttribute() = default;

VObject VFnNumericAttribute::create(const VString &fullName, const VString &briefName,
                                    VFnNumericData::Type unitType, double defaultValue,
                                    VStatus *ReturnStatus) {
  if (unitType <= VFnNumericData::kInvalid || unitType >= VFnNumericData::kLast) {
    report(ReturnStatus,
           VStatus(VStatus::kInvalidParameter, "The numeric type is not one an attribute holds"));
    return VObject();
  }
  AttributeInfo info;
  info.numericType = unitType;
  info.defaultNumber = attributes::numericValue(unitType, defaultValue);
  VObject attribute = attributes::make(fullName, briefName, info, ReturnStatus);
  if (!attribute.isNull()) setObject(attribute);
  return attribute;
}

VObject VFnNumericAttribute::createPoint(const VString &fullName, const VString &briefName,
                                         VStatus *ReturnStatus) {
  return create(fullName, briefName, VFnNumericData::k3Double, 0.0, ReturnStatus);
}

VFnNumericData::Type VFnNumericAttribute::unitType(VStatus *ReturnStatus) const {
  AttributeInfo info;
  if (!readNumeric(object(), &info, ReturnStatus)) return VFnNumericData::kInvalid;
  // A bare attribute object holds a double.
  return info.numericType ? static_cast<VFnNumericData::Type>(info.numericType)
                          : VFnNumericData::kDouble;
}

VStatus VFnNumericAttribute::setMin(double minValue) {
  return changeNumeric(object(), [minValue](AttributeInfo &a) {
    a.hasMin = true;
    a.min = minValue;
  });
}

VStatus VFnNumericAttribute::setMax(double maxValue) {
  return changeNumeric(object(), [maxValue](AttributeInfo &a) {
    a.hasMax = true;
    a.max = maxValue;
  });
}

VStatus VFnNumericAttribute::setDefault(double defaultValue) {
  return changeNumeric(object(), [defaultValue](AttributeInfo &a) {
    a.defaultNumber = attributes::numericValue(a.numericType, defaultValue);
  });
}

bool VFnNumericAttribute::hasMin(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readNumeric(object(), &info, ReturnStatus) && info.hasMin;
}

bool VFnNumericAttribute::hasMax(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readNumeric(object(), &info, ReturnStatus) && info.hasMax;
}

double VFnNumericAttribute::minimum(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readNumeric(object(), &info, ReturnStatus) && info.hasMin ? info.min : 0.0;
}

double VFnNumericAttribute::maximum(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readNumeric(object(), &info, ReturnStatus) && info.hasMax ? info.max : 0.0;
}

double VFnNumericAttribute::defaultValue(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readNumeric(object(), &info, ReturnStatus) ? info.defaultNumber : 0.0;
}

const char *VFnNumericAttribute::className() { return "VFnNumericAttribute"; }

OPENVORLA_NAMESPACE_CLOSE
