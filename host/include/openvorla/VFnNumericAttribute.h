// Function set that makes numeric attributes and sets their default and range.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnAttribute.h>
#include <openvorla/VFnNumericData.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnNumericAttribute : public VFnAttribute {
public:
  VFnNumericAttribute();
  // kInvalidParameter, and nothing attached, for an object that is not a
  // numeric attribute.
  VFnNumericAttribute(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnNumericAttribute() override;

  // A new attribute of one value of the type, attached to this function set.
  // A compound type (k2Double ... k4Double) holds that many values, each
  // defaultValue by default. kInvalidParameter, and the null object, for an
  // empty or ill-formed name (letters, digits and '_', not starting with a
  // digit) or a type that is none of VFnNumericData's.
  VObject create(const VString &fullName, const VString &briefName,
                 VFnNumericData::Type unitType, double defaultValue = 0,
                 VStatus *ReturnStatus = NULL);
  // A point: three doubles (k3Double), each 0 by default.
  VObject createPoint(const VString &fullName, const VString &briefName,
                      VStatus *ReturnStatus = NULL);

  VFnNumericData::Type unitType(VStatus *ReturnStatus = NULL) const;
  // The graph keeps values set on the attribute within its minimum and
  // maximum, when it has them.
  VStatus setMin(double minValue);
  VStatus setMax(double maxValue);
  VStatus setDefault(double defaultValue);
  bool hasMin(VStatus *ReturnStatus = NULL) const;
  bool hasMax(VStatus *ReturnStatus = NULL) const;
  // 0 when the attribute has none.
  double minimum(VStatus *ReturnStatus = NULL) const;
  double maximum(VStatus *ReturnStatus = NULL) const;
  double defaultValue(VStatus *ReturnStatus = NULL) const;

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
