// VPxMultiPolyTweakUVCommand: construction and destruction.
#include <openvorla/VPxMultiPolyTweakUVCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxMultiPolyTweakUVCommand::VPxMultiPolyTweakUVCommand() {
  standin::noteConstructed("VPxMultiPolyTweakUVCommand");
}
VPxMultiPolyTweakUVCommand::~VPxMultiPolyTweakUVCommand() {
  standin::noteDestroyed("VPxMultiPolyTweakUVCommand");
}

OPENVORLA_NAMESPACE_CLOSE
