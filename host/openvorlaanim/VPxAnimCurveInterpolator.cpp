// VPxAnimCurveInterpolator: construction and destruction.
#include <openvorla/VPxAnimCurveInterpolator.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxAnimCurveInterpolator::VPxAnimCurveInterpolator() {
  standin::noteConstructed("VPxAnimCurveInterpolator");
}
VPxAnimCurveInterpolator::~VPxAnimCurveInterpolator() {
  standin::noteDestroyed("VPxAnimCurveInterpolator");
}

OPENVORLA_NAMESPACE_CLOSE
