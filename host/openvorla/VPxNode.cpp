// VPxNode: construction and the static attribute objects.
#include <openvorla/VPxNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxNode::VPxNode() { standin::noteConstructed("VPxNode"); }
VPxNode::~VPxNode() { standin::noteDestroyed("VPxNode"); }

VObject VPxNode::message = standin::makeAttribute("VPxNode.message");
VObject VPxNode::isHistoricallyInteresting =
    standin::makeAttribute("VPxNode.isHistoricallyInteresting");
VObject VPxNode::caching = standin::makeAttribute("VPxNode.caching");
VObject VPxNode::state = standin::makeAttribute("VPxNode.state");
VObject VPxNode::frozen = standin::makeAttribute("VPxNode.frozen");

OPENVORLA_NAMESPACE_CLOSE
