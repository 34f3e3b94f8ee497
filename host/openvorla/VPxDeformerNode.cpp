// VPxDeformerNode: construction and the static attribute objects.
#include <openvorla/VPxDeformerNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxDeformerNode::VPxDeformerNode() { standin::noteConstructed("VPxDeformerNode"); }
VPxDeformerNode::~VPxDeformerNode() { standin::noteDestroyed("VPxDeformerNode"); }

VObject VPxDeformerNode::weightList = standin::makeAttribute("VPxDeformerNode.weightList");
VObject VPxDeformerNode::weights = standin::makeAttribute("VPxDeformerNode.weights");

OPENVORLA_NAMESPACE_CLOSE
