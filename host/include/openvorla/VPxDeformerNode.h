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

  VPxNode::Type type() const override;  // kDeformerNode
  VStatus deform(VDataBlock &block, VItGeometry &iter, const VMatrix &mat,
                 unsigned int multiIndex) override;
  VObject &accessoryAttribute() const override;
  VStatus accessoryNodeSetup(VDagModifier &cmd) override;
  VStatus setModifiedCallback(VSelectionList &list, bool listAdded) override;
  unsigned int getDeformationDetails() const override;

  // The weight of point wtIndex of the geometry multiIndex, from weightList;
  // 1 where no weight is set.
  float weightValue(VDataBlock &block, unsigned int multiIndex, unsigned int wtIndex);
  static const char *className();

  static VObject weightList;
  static VObject weights;
};

OPENVORLA_NAMESPACE_CLOSE
