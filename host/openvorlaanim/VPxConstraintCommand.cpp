// VPxConstraintCommand: the host's default constraint command.
#include <openvorla/VPxConstraintCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

const VObject &nullAttribute() {
  static const VObject null;
  return null;
}

void appendUnlessNull(VObjectArray &array, const VObject &attribute) {
  if (!attribute.isNull()) array.append(attribute);
}

VStatus noScene() {
  return VStatus(VStatus::kNotImplemented, "The stand-in has no scene to constrain");
}

}  // namespace

VPxConstraintCommand::VPxConstraintCommand() { standin::noteConstructed("VPxConstraintCommand"); }
VPxConstraintCommand::~VPxConstraintCommand() { standin::noteDestroyed("VPxConstraintCommand"); }

VStatus VPxConstraintCommand::doIt(const VArgList &args) {
  VStatus parsed = parseArgs(args);
  return parsed ? noScene() : parsed;
}

VStatus VPxConstraintCommand::undoIt() { return noScene(); }
VStatus VPxConstraintCommand::redoIt() { return noScene(); }
bool VPxConstraintCommand::isUndoable() const { return true; }
VStatus VPxConstraintCommand::appendSyntax() { return VStatus::kSuccess; }
const char *VPxConstraintCommand::className() { return "VPxConstraintCommand"; }

VStatus VPxConstraintCommand::parseArgs(const VArgList &) { return VStatus::kSuccess; }
void VPxConstraintCommand::createdConstraint(VPxConstraint *) {}

const VObject &VPxConstraintCommand::constraintInstancedAttribute() const {
  return nullAttribute();
}
const VObject &VPxConstraintCommand::constraintOutputAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::constraintTargetInstancedAttribute() const {
  return nullAttribute();
}
const VObject &VPxConstraintCommand::constraintTargetAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::constraintTargetWeightAttribute() const {
  return nullAttribute();
}
const VObject &VPxConstraintCommand::constraintRestAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::constraintEnableRestAttribute() const {
  return nullAttribute();
}
const VObject &VPxConstraintCommand::offsetAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::aimVectorAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::upVectorAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::worldUpVectorAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::worldUpMatrixAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::worldUpTypeAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::objectAttribute() const { return nullAttribute(); }

unsigned int VPxConstraintCommand::constraintTypeId() const { return 0; }
VPxConstraintCommand::TargetType VPxConstraintCommand::targetType() const { return kTransform; }
bool VPxConstraintCommand::supportsOffset() const { return false; }
bool VPxConstraintCommand::hasVectorFlags() const { return false; }
bool VPxConstraintCommand::hasUpVectorFlags() const { return false; }
bool VPxConstraintCommand::hasWorldUpVectorFlags() const { return false; }

void VPxConstraintCommand::getObjectAttributesArray(VObjectArray &array) {
  appendUnlessNull(array, objectAttribute());
}

void VPxConstraintCommand::getOutputAttributes(VObjectArray &array) {
  appendUnlessNull(array, constraintOutputAttribute());
}

VStatus VPxConstraintCommand::connectTarget(VDagPath &, int) { return noScene(); }
VStatus VPxConstraintCommand::connectTarget(VDagPath &, int, VDGModifier &) { return noScene(); }
VStatus VPxConstraintCommand::handleNewTargets(VObject &) { return noScene(); }
VStatus VPxConstraintCommand::handleNewTargets(VObject &, VDGModifier &) { return noScene(); }
VStatus VPxConstraintCommand::connectObjectAndConstraint(VDGModifier &) { return noScene(); }
VStatus VPxConstraintCommand::setRestPosition(const VObject &) { return noScene(); }

OPENVORLA_NAMESPACE_CLOSE
