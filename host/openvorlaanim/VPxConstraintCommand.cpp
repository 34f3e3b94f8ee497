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

}  // namespace

VPxConstraintCommand::VPxConstraintCommand() { standin::noteConstructed("VPxConstraintCommand"); }
VPxConstraintCommand::~VPxConstraintCommand() { standin::noteDestroyed("VPxConstraintCommand"); }

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
const VObject &VPxConstraintCommand::offsetAttribute() const { return nullAttribute(); }
const VObject &VPxConstraintCommand::objectAttribute() const { return nullAttribute(); }
VTypeId VPxConstraintCommand::constraintTypeId() const { return VTypeId(); }
VPxConstraintCommand::TargetType VPxConstraintCommand::targetType() const { return kTransform; }
bool VPxConstraintCommand::supportsOffset() const { return false; }
bool VPxConstraintCommand::hasVectorFlags() const { return false; }
bool VPxConstraintCommand::hasUpVectorFlags() const { return false; }
bool VPxConstraintCommand::hasWorldUpVectorFlags() const { return false; }

void VPxConstraintCommand::createdConstraint(VPxConstraint *) {}

void VPxConstraintCommand::getObjectAttributesArray(VObjectArray &array) {
  appendUnlessNull(array, objectAttribute());
}

void VPxConstraintCommand::getOutputAttributes(VObjectArray &array) {
  appendUnlessNull(array, constraintOutputAttribute());
}

OPENVORLA_NAMESPACE_CLOSE
