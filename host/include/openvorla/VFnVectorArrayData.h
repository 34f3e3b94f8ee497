// Function set for data objects holding an array of vectors.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnData.h>
#include <openvorla/VVectorArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnVectorArrayData : public VFnData {
public:
  VFnVectorArrayData();
  // kInvalidParameter, and nothing attached, for an object that holds no such array.
  VFnVectorArrayData(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnVectorArrayData() override;

  // A new data object holding a copy of the vectors, attached to this function set;
  // a data block's value takes it with setMObject.
  VObject create(const VVectorArray &vectors, VStatus *ReturnStatus = NULL);
  // A copy of the vectors of the attached object.
  VVectorArray array(VStatus *ReturnStatus = NULL) const;
  VStatus set(const VVectorArray &vectors);
  unsigned int length(VStatus *ReturnStatus = NULL) const;
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
