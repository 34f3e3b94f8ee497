// VPxToolCommand: construction and destruction.
#include <openvorla/VPxToolCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxToolCommand::VPxToolCommand() { standin::noteConstructed("VPxToolCommand"); }
VPxToolCommand::~VPxToolCommand() { standin::noteDestroyed("VPxToolCommand"); }

OPENVORLA_NAMESPACE_CLOSE
