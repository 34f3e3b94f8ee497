// Base class of plug-in deformers with per-point weights.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxGeometryFilter.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxDeformerNode : public VPxGeometryFilter {
public:
  VPxDeformerNode();
  ~VPxDeformerNode() override;

  static VObject weightList;
  static VObject weights;
};

OPENVORLA_NAMESPACE_CLOSE
