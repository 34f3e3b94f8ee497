// VPxManipulatorNode: construction and the static attribute objects.
#include <openvorla/VPxManipulatorNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxManipulatorNode::VPxManipulatorNode() { standin::noteConstructed("VPxManipulatorNode"); }
VPxManipulatorNode::~VPxManipulatorNode() { standin::noteDestroyed("VPxManipulatorNode"); }

VObject VPxManipulatorNode::connectedNodes =
    standin::makeAttribute("VPxManipulatorNode.connectedNodes");

OPENVORLA_NAMESPACE_CLOSE
