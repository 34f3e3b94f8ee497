// Base class of plug-in surface shapes whose components are control points.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxSurfaceShape.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxComponentShape : public VPxSurfaceShape {
public:
  VPxComponentShape();
  ~VPxComponentShape() override;
};

OPENVORLA_NAMESPACE_CLOSE
