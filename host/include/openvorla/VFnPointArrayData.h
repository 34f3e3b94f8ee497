// Function set for data objects holding an array of the points of a geometry, as deformers read and write them.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnData.h>
#include <openvorla/VPointArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnPointArrayData : public VFnData {
public:
  VFnPointArrayData();
  // kInvalidParameter, and nothing attached, for an object that holds no such array.
  VFnPointArrayData(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnPointArrayData() override;

  // A new data object holding a copy of the points, attached to this function set;
  // a data block's value takes it with setMObject.
  VObject create(const VPointArray &points, VStatus *ReturnStatus = NULL);
  // A copy of the points of the attached object.
  VPointArray array(VStatus *ReturnStatus = NULL) const;
  VStatus set(const VPointArray &points);
  unsigned int length(VStatus *ReturnStatus = NULL) const;
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
