// VPxDeformerNode: construction and the static attribute objects.
#include <openvorla/VPxDeformerNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxDeformerNode::VPxDeformerNode() { standin::noteConstructed("VPxDeformerNode"); }
VPxDeformerNode::~VPxDeformerNode() { standin::noteDestroyed("VPxDeformerNode"); }

VPxNode::Type VPxDeformerNode::type() const { return kDeformerNode; }

// A deformer answers as any geometry filter until a plug-in says otherwise.
VStatus VPxDeformerNode::deform(VDataBlock &block, VItGeometry &iter, const VMatrix &mat,
                                unsigned int multiIndex) {
  return VPxGeometryFilter::deform(block, iter, mat, multiIndex);
}

VObject &VPxDeformerNode::accessoryAttribute() const {
  return VPxGeometryFilter::accessoryAttribute();
}

VStatus VPxDeformerNode::accessoryNodeSetup(VDagModifier &cmd) {
  return VPxGeometryFilter::accessoryNodeSetup(cmd);
}

VStatus VPxDeformerNode::setModifiedCallback(VSelectionList &list, bool listAdded) {
  return VPxGeometryFilter::setModifiedCallback(list, listAdded);
}

unsigned int VPxDeformerNode::getDeformationDetails() const {
  return VPxGeometryFilter::getDeformationDetails();
}

// The stand-in's data blocks hold no per-point weights.
float VPxDeformerNode::weightValue(VDataBlock &, unsigned int, unsigned int) { return 1.0f; }
const char *VPxDeformerNode::className() { return "VPxDeformerNode"; }

VObject VPxDeformerNode::weightList = standin::makeAttribute("VPxDeformerNode.weightList");
VObject VPxDeformerNode::weights = standin::makeAttribute("VPxDeformerNode.weights");

OPENVORLA_NAMESPACE_CLOSE
