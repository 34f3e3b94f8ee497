// Base class of plug-in blend shapes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxGeometryFilter.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxBlendShape : public VPxGeometryFilter {
public:
  VPxBlendShape();
  ~VPxBlendShape() override;

  static VObject weight;
  static VObject inputTarget;
  static VObject inputTargetGroup;
  static VObject inputTargetItem;
  static VObject inputGeomTarget;
  static VObject inputPointsTarget;
  static VObject inputComponentsTarget;
  static VObject targetWeights;
};

OPENVORLA_NAMESPACE_CLOSE
