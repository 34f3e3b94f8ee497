// VPxAnimCurveInterpolator: construction, destruction, the default set-up and
// the registered flags.
#include <openvorla/VPxAnimCurveInterpolator.h>

#include <standin/Lifetime.h>
#include <standin/Registry.h>

OPENVORLA_NAMESPACE_OPEN

VPxAnimCurveInterpolator::VPxAnimCurveInterpolator() {
  standin::noteConstructed("VPxAnimCurveInterpolator");
}
VPxAnimCurveInterpolator::~VPxAnimCurveInterpolator() {
  standin::noteDestroyed("VPxAnimCurveInterpolator");
}

void VPxAnimCurveInterpolator::initialize(const VObject &, unsigned int) {}
int VPxAnimCurveInterpolator::registeredFlags(const VString &typeName) {
  for (const standin::RegistrationInfo &r : standin::registrations())
    if (r.kind == "AnimCurveInterpolator" && r.name == typeName.asUTF8()) return r.flags;
  return 0;
}

const char *VPxAnimCurveInterpolator::className() { return "VPxAnimCurveInterpolator"; }

OPENVORLA_NAMESPACE_CLOSE
