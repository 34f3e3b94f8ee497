// VPxCommand: construction and destruction.
#include <openvorla/VPxCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxCommand::VPxCommand() { standin::noteConstructed("VPxCommand"); }
VPxCommand::~VPxCommand() { standin::noteDestroyed("VPxCommand"); }

OPENVORLA_NAMESPACE_CLOSE
