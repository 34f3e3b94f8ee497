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

  static VObject weightList;
  static VObject weights;
  static VObject matrix;
  static VObject bindPreMatrix;
};

OPENVORLA_NAMESPACE_CLOSE
