// VPxConstraint: construction and the static attribute objects.
#include <openvorla/VPxConstraint.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxConstraint::VPxConstraint() { standin::noteConstructed("VPxConstraint"); }
VPxConstraint::~VPxConstraint() { standin::noteDestroyed("VPxConstraint"); }

VObject VPxConstraint::enableRestPosition =
    standin::makeAttribute("VPxConstraint.enableRestPosition");
VObject VPxConstraint::lockOutput = standin::makeAttribute("VPxConstraint.lockOutput");

OPENVORLA_NAMESPACE_CLOSE
