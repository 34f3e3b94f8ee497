// VPxPolyTweakUVCommand: construction and destruction.
#include <openvorla/VPxPolyTweakUVCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxPolyTweakUVCommand::VPxPolyTweakUVCommand() {
  standin::noteConstructed("VPxPolyTweakUVCommand");
}
VPxPolyTweakUVCommand::~VPxPolyTweakUVCommand() { standin::noteDestroyed("VPxPolyTweakUVCommand"); }

OPENVORLA_NAMESPACE_CLOSE
