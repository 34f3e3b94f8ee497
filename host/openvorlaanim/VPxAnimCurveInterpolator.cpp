// VPxAnimCurveInterpolator: construction, destruction and the default set-up.
#include <openvorla/VPxAnimCurveInterpolator.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxAnimCurveInterpolator::VPxAnimCurveInterpolator() {
  standin::noteConstructed("VPxAnimCurveInterpolator");
}
VPxAnimCurveInterpolator::~VPxAnimCurveInterpolator() {
  standin::noteDestroyed("VPxAnimCurveInterpolator");
}

void VPxAnimCurveInterpolator::initialize(const VObject &, unsigned int) {}
const char *VPxAnimCurveInterpolator::className() { return "VPxAnimCurveInterpolator"; }

OPENVORLA_NAMESPACE_CLOSE
