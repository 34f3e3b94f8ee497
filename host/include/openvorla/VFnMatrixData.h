// Function set for data objects holding a matrix.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnData.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnMatrixData : public VFnData {
public:
  VFnMatrixData();
  // kInvalidParameter, and nothing attached, for an object that holds no matrix.
  VFnMatrixData(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnMatrixData() override;

  // A new data object holding the matrix, attached to this function set.
  VObject create(const VMatrix &matrix, VStatus *ReturnStatus = NULL);
  VMatrix matrix(VStatus *ReturnStatus = NULL) const;
  VStatus set(const VMatrix &matrix);
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
