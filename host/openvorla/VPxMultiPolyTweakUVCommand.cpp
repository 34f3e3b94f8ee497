// VPxMultiPolyTweakUVCommand: the host's default command, which moves no UVs.
#include <openvorla/VPxMultiPolyTweakUVCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxMultiPolyTweakUVCommand::VPxMultiPolyTweakUVCommand() {
  standin::noteConstructed("VPxMultiPolyTweakUVCommand");
}
VPxMultiPolyTweakUVCommand::~VPxMultiPolyTweakUVCommand() {
  standin::noteDestroyed("VPxMultiPolyTweakUVCommand");
}

VStatus VPxMultiPolyTweakUVCommand::parseSyntax(VArgDatabase &) { return VStatus::kSuccess; }
VStatus VPxMultiPolyTweakUVCommand::preProcessUVs() { return VStatus::kSuccess; }

VStatus VPxMultiPolyTweakUVCommand::getTweakedUVs(const VObject &, VIntArray &, VFloatArray &,
                                                  VFloatArray &) {
  return VStatus::kNotImplemented;
}

VSyntax VPxMultiPolyTweakUVCommand::newSyntax() {
  VSyntax syntax;
  syntax.addFlag("-uvs", "-uvSetName", VSyntax::kString);
  syntax.setObjectType(VSyntax::kSelectionList, 1);
  return syntax;
}

OPENVORLA_NAMESPACE_CLOSE
