// VFnTypedAttribute: attributes holding data of a kind: strings, matrices and
// arrays of numbers, integers, points and vectors.
#include <openvorla/VFnTypedAttribute.h>

#include "AttributeSets.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

using attributes::report;

bool readTyped(const VObject &attached, AttributeInfo *info, VStatus *ReturnStatus) {
  if (!attributes::read(attached, info, ReturnStatus)) return false;
  if (info->dataType) return true;
  report(ReturnStatus,
         VStatus(VStatus::kInvalidParameter, "The attribute is not a typed attribute"));
  return false;
}

}  // namespace

VFnTypedAttribute::VFnTypedAttribute() = default;

VFnTypedAttribute::VFnTypedAttribute(const VObject &object, VStatus *ReturnStatus) {
  AttributeInfo info;
  if (!readTyped(object, &info, nullptr)) {
    report(ReturnStatus,
           VStatus(VStatus::kInvalidParameter, "The object is not a typed attribute"));
    return;
  }
  setObject(object);
  report(ReturnStatus, VStatus::kSuccess);
}

VFnTypedAttribute::~VFnTypedAttribute() = default;

VObject VFnTypedAttribute::create(const VString &fullName, const VString &briefName,
                                  VFnData::Type type, VStatus *ReturnStatus) {
  switch (type) {
    case VFnData::kString:
    case VFnData::kMatrix:
    case VFnData::kDoubleArray:
    case VFnData::kIntArray:
    case VFnData::kPointArray:
    case VFnData::kVectorArray:
      break;
    default:
      report(ReturnStatus,
             VStatus(VStatus::kInvalidParameter,
                     "Typed attributes hold strings, matrices and arrays of numbers, integers, "
                     "points or vectors"));
      return VObject();
  }
  AttributeInfo info;
  info.dataType = type;
  info.isString = type == VFnData::kString;
  VObject attribute = attributes::make(fullName, briefName, info, ReturnStatus);
  if (!attribute.isNull()) setObject(attribute);
  return attribute;
}

VFnData::Type VFnTypedAttribute::attrType(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readTyped(object(), &info, ReturnStatus) ? static_cast<VFnData::Type>(info.dataType)
                                                  : VFnData::kInvalid;
}

VStatus VFnTypedAttribute::setDefault(const VString &text) {
  AttributeInfo info;
  VStatus status;
  if (!readTyped(object(), &info, &status)) return status;
  std::string utf8 = text.asUTF8();
  return attributes::change(object(), [&utf8](AttributeInfo &a) { a.defaultText = utf8; });
}

VString VFnTypedAttribute::defaultString(VStatus *ReturnStatus) const {
  AttributeInfo info;
  return readTyped(object(), &info, ReturnStatus) ? VString(info.defaultText.c_str()) : VString();
}

const char *VFnTypedAttribute::className() { return "VFnTypedAttribute"; }

OPENVORLA_NAMESPACE_CLOSE
