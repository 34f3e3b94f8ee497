// What the attribute function sets share: making attribute objects with their
// declaration, and reading and changing the declaration of the attached one.
#pragma once

#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <functional>

#include "ObjectRecords.h"

OPENVORLA_NAMESPACE_OPEN

namespace attributes {

// A new attribute object named fullName, declared as info says with its brief
// name filled in (the full name when briefName is empty). kInvalidParameter
// and the null object for a name that is empty or not letters, digits and
// '_', not starting with a digit.
VObject make(const VString &fullName, const VString &briefName, AttributeInfo info,
             VStatus *ReturnStatus);

// The attached attribute's declaration; false with kInvalidParameter when the
// function set is attached to none.
bool read(const VObject &attached, AttributeInfo *info, VStatus *ReturnStatus);
VStatus change(const VObject &attached, const std::function<void(AttributeInfo &)> &change);

// A number as an attribute of the VFnNumericData type holds it: booleans
// as 0 or 1, integers truncated towards zero, floats rounded to float.
double numericValue(int numericType, double value);

inline void report(VStatus *ReturnStatus, const VStatus &status) {
  if (ReturnStatus) *ReturnStatus = status;
}

}  // namespace attributes

OPENVORLA_NAMESPACE_CLOSE
