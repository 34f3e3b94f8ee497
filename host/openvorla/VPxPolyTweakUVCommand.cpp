// VPxPolyTweakUVCommand: the host's default command, which moves no UVs.
#include <openvorla/VPxPolyTweakUVCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxPolyTweakUVCommand::VPxPolyTweakUVCommand() {
  standin::noteConstructed("VPxPolyTweakUVCommand");
}
VPxPolyTweakUVCommand::~VPxPolyTweakUVCommand() { standin::noteDestroyed("VPxPolyTweakUVCommand"); }

VStatus VPxPolyTweakUVCommand::parseSyntax(VArgDatabase &) { return VStatus::kSuccess; }

VStatus VPxPolyTweakUVCommand::getTweakedUVs(const VObject &, VIntArray &, VFloatArray &,
                                             VFloatArray &) {
  return VStatus::kNotImplemented;
}

VSyntax VPxPolyTweakUVCommand::newSyntax() {
  VSyntax syntax;
  syntax.addFlag("-uvs", "-uvSetName", VSyntax::kString);
  syntax.setObjectType(VSyntax::kSelectionList, 1);
  syntax.setMaxObjects(1);
  return syntax;
}

OPENVORLA_NAMESPACE_CLOSE
