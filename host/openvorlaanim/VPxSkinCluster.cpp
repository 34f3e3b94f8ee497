// VPxSkinCluster: construction and the static attribute objects.
#include <openvorla/VPxSkinCluster.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxSkinCluster::VPxSkinCluster() { standin::noteConstructed("VPxSkinCluster"); }
VPxSkinCluster::~VPxSkinCluster() { standin::noteDestroyed("VPxSkinCluster"); }

VPxNode::Type VPxSkinCluster::type() const { return kSkinCluster; }
// The stand-in's data blocks hold no per-point weights.
float VPxSkinCluster::weightValue(VDataBlock &, unsigned int, unsigned int) { return 1.0f; }
const char *VPxSkinCluster::className() { return "VPxSkinCluster"; }

VObject VPxSkinCluster::weightList = standin::makeAttribute("VPxSkinCluster.weightList");
VObject VPxSkinCluster::weights = standin::makeAttribute("VPxSkinCluster.weights");
VObject VPxSkinCluster::matrix = standin::makeAttribute("VPxSkinCluster.matrix");
VObject VPxSkinCluster::bindPreMatrix = standin::makeAttribute("VPxSkinCluster.bindPreMatrix");

OPENVORLA_NAMESPACE_CLOSE
