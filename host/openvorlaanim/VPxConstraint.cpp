// VPxConstraint: construction and the static attribute objects.
#include <openvorla/VPxConstraint.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxConstraint::VPxConstraint() { standin::noteConstructed("VPxConstraint"); }
VPxConstraint::~VPxConstraint() { standin::noteDestroyed("VPxConstraint"); }

const VObject VPxConstraint::weightAttribute() const { return VObject(); }
const VObject VPxConstraint::targetAttribute() const { return VObject(); }
const VObject VPxConstraint::constraintRotateOrderAttribute() const { return VObject(); }
const VObject VPxConstraint::passiveOutputAttribute() const { return VObject(); }
void VPxConstraint::getOutputAttributes(VObjectArray &) {}
const char *VPxConstraint::className() { return "VPxConstraint"; }

VObject VPxConstraint::enableRestPosition =
    standin::makeAttribute("VPxConstraint.enableRestPosition");
VObject VPxConstraint::lockOutput = standin::makeAttribute("VPxConstraint.lockOutput");

OPENVORLA_NAMESPACE_CLOSE
