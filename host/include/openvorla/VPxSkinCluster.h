// Base class of plug-in skin clusters.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxGeometryFilter.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxSkinCluster : public VPxGeometryFilter {
public:
  VPxSkinCluster();
  ~VPxSkinCluster() override;

  VPxNode::Type type() const override;  // kSkinCluster
  // The weight of point wtIndex of the geometry multiIndex, from weightList;
  // 1 where no weight is set.
  float weightValue(VDataBlock &block, unsigned int multiIndex, unsigned int wtIndex);
  static const char *className();

  static VObject weightList;
  static VObject weights;
  static VObject matrix;
  static VObject bindPreMatrix;
};

OPENVORLA_NAMESPACE_CLOSE
