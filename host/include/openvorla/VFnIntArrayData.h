// Function set for data objects holding an array of integers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnData.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnIntArrayData : public VFnData {
public:
  VFnIntArrayData();
  // kInvalidParameter, and nothing attached, for an object that holds no such array.
  VFnIntArrayData(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnIntArrayData() override;

  // A new data object holding a copy of the integers, attached to this function set;
  // a data block's value takes it with setMObject.
  VObject create(const VIntArray &integers, VStatus *ReturnStatus = NULL);
  // A copy of the integers of the attached object.
  VIntArray array(VStatus *ReturnStatus = NULL) const;
  VStatus set(const VIntArray &integers);
  unsigned int length(VStatus *ReturnStatus = NULL) const;
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
