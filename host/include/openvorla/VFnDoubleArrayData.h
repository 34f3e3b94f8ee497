// Function set for data objects holding an array of numbers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnData.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnDoubleArrayData : public VFnData {
public:
  VFnDoubleArrayData();
  // kInvalidParameter, and nothing attached, for an object that holds no such array.
  VFnDoubleArrayData(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnDoubleArrayData() override;

  // A new data object holding a copy of the numbers, attached to this function set;
  // a data block's value takes it with setMObject.
  VObject create(const VDoubleArray &numbers, VStatus *ReturnStatus = NULL);
  // A copy of the numbers of the attached object.
  VDoubleArray array(VStatus *ReturnStatus = NULL) const;
  VStatus set(const VDoubleArray &numbers);
  unsigned int length(VStatus *ReturnStatus = NULL) const;
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
