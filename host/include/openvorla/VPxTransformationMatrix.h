// Base class of the transformation matrices of plug-in transforms.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VTypeId.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxTransformationMatrix {
public:
  VPxTransformationMatrix();
  VPxTransformationMatrix(const VPxTransformationMatrix &other);
  virtual ~VPxTransformationMatrix();
  VPxTransformationMatrix &operator=(const VPxTransformationMatrix &other);

  static const VPxTransformationMatrix identity;
  static VTypeId baseTransformationMatrixId;
};

OPENVORLA_NAMESPACE_CLOSE
