// VPxBakeEngine: construction, destruction and the progress of a bake.
#include <openvorla/VPxBakeEngine.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxBakeEngine::VPxBakeEngine() : fProgress(0.0) { standin::noteConstructed("VPxBakeEngine"); }
VPxBakeEngine::~VPxBakeEngine() { standin::noteDestroyed("VPxBakeEngine"); }

VStatus VPxBakeEngine::setProgress(double fraction) {
  if (!(fraction >= 0.0 && fraction <= 1.0))
    return VStatus(VStatus::kInvalidParameter, "Progress is a fraction from 0 to 1");
  fProgress = fraction;
  return VStatus::kSuccess;
}

// The stand-in has no progress window, so nobody can interrupt a bake.
bool VPxBakeEngine::isInterruptRequested() const { return false; }

OPENVORLA_NAMESPACE_CLOSE
