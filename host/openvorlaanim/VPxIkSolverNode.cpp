// VPxIkSolverNode: construction and destruction.
#include <openvorla/VPxIkSolverNode.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxIkSolverNode::VPxIkSolverNode() { standin::noteConstructed("VPxIkSolverNode"); }
VPxIkSolverNode::~VPxIkSolverNode() { standin::noteDestroyed("VPxIkSolverNode"); }

OPENVORLA_NAMESPACE_CLOSE
