// Function set that makes attributes holding data of a kind, such as strings.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnAttribute.h>
#include <openvorla/VFnData.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnTypedAttribute : public VFnAttribute {
public:
  VFnTypedAttribute();
  // kInvalidParameter, and nothing attached, for an object that is not a
  // typed attribute.
  VFnTypedAttribute(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnTypedAttribute() override;

  // A new attribute holding data of the kind, attached to this function set;
  // its default is empty. Names as for numeric attributes. The graph holds
  // kString data only: other kinds are kInvalidParameter and give the null
  // object.
  VObject create(const VString &fullName, const VString &briefName, VFnData::Type type,
                 VStatus *ReturnStatus = NULL);

  VFnData::Type attrType(VStatus *ReturnStatus = NULL) const;
  VStatus setDefault(const VString &text);
  VString defaultString(VStatus *ReturnStatus = NULL) const;

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
