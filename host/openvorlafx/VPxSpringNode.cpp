// VPxSpringNode: construction and the static attribute objects.
#include <openvorla/VPxSpringNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxSpringNode::VPxSpringNode() { standin::noteConstructed("VPxSpringNode"); }
VPxSpringNode::~VPxSpringNode() { standin::noteDestroyed("VPxSpringNode"); }

VObject VPxSpringNode::mEnd1Weight = standin::makeAttribute("VPxSpringNode.mEnd1Weight");
VObject VPxSpringNode::mEnd2Weight = standin::makeAttribute("VPxSpringNode.mEnd2Weight");
VObject VPxSpringNode::mDeltaTime = standin::makeAttribute("VPxSpringNode.mDeltaTime");

OPENVORLA_NAMESPACE_CLOSE
