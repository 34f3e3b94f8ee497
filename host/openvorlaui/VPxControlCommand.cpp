// VPxControlCommand: construction and destruction.
#include <openvorla/VPxControlCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxControlCommand::VPxControlCommand() { standin::noteConstructed("VPxControlCommand"); }
VPxControlCommand::~VPxControlCommand() { standin::noteDestroyed("VPxControlCommand"); }

OPENVORLA_NAMESPACE_CLOSE
