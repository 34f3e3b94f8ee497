// VPxContextCommand: construction and destruction.
#include <openvorla/VPxContextCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxContextCommand::VPxContextCommand() { standin::noteConstructed("VPxContextCommand"); }
VPxContextCommand::~VPxContextCommand() { standin::noteDestroyed("VPxContextCommand"); }

OPENVORLA_NAMESPACE_CLOSE
