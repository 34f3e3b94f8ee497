// VPxPolyTweakUVInteractiveCommand: construction and destruction.
#include <openvorla/VPxPolyTweakUVInteractiveCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxPolyTweakUVInteractiveCommand::VPxPolyTweakUVInteractiveCommand() {
  standin::noteConstructed("VPxPolyTweakUVInteractiveCommand");
}
VPxPolyTweakUVInteractiveCommand::~VPxPolyTweakUVInteractiveCommand() {
  standin::noteDestroyed("VPxPolyTweakUVInteractiveCommand");
}

VStatus VPxPolyTweakUVInteractiveCommand::doIt(const VArgList &) { return VStatus::kSuccess; }

OPENVORLA_NAMESPACE_CLOSE
