// VPxPolyTweakUVInteractiveCommand: the UVs moved so far, and their record.
#include <openvorla/VPxPolyTweakUVInteractiveCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus nothingMoved() { return VStatus(VStatus::kFailure, "No UVs were moved"); }

}  // namespace

VPxPolyTweakUVInteractiveCommand::VPxPolyTweakUVInteractiveCommand() : fMoved(0) {
  standin::noteConstructed("VPxPolyTweakUVInteractiveCommand");
}

VPxPolyTweakUVInteractiveCommand::~VPxPolyTweakUVInteractiveCommand() {
  standin::noteDestroyed("VPxPolyTweakUVInteractiveCommand");
}

VStatus VPxPolyTweakUVInteractiveCommand::doIt(const VArgList &) { return VStatus::kSuccess; }

VStatus VPxPolyTweakUVInteractiveCommand::cancel() {
  if (fMoved == 0) return nothingMoved();
  fMoved = 0;
  return VStatus::kSuccess;
}

VStatus VPxPolyTweakUVInteractiveCommand::finalize() {
  if (fMoved == 0) return nothingMoved();
  return doFinalize("polyTweakUV");
}

bool VPxPolyTweakUVInteractiveCommand::isUndoable() const { return true; }

VStatus VPxPolyTweakUVInteractiveCommand::setUVs(const VObject &, VIntArray &uvList, VFloatArray &,
                                                 VFloatArray &, const VString *) {
  if (uvList.length() == 0) return VStatus(VStatus::kInvalidParameter, "No UVs to move");
  fMoved += uvList.length();
  return VStatus::kSuccess;
}

const char *VPxPolyTweakUVInteractiveCommand::className() {
  return "VPxPolyTweakUVInteractiveCommand";
}

OPENVORLA_NAMESPACE_CLOSE
