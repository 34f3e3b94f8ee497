// VPxConstraintCommand: construction and destruction.
#include <openvorla/VPxConstraintCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxConstraintCommand::VPxConstraintCommand() { standin::noteConstructed("VPxConstraintCommand"); }
VPxConstraintCommand::~VPxConstraintCommand() { standin::noteDestroyed("VPxConstraintCommand"); }

OPENVORLA_NAMESPACE_CLOSE
