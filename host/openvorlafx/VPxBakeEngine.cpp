// VPxBakeEngine: construction and destruction.
#include <openvorla/VPxBakeEngine.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxBakeEngine::VPxBakeEngine() { standin::noteConstructed("VPxBakeEngine"); }
VPxBakeEngine::~VPxBakeEngine() { standin::noteDestroyed("VPxBakeEngine"); }

OPENVORLA_NAMESPACE_CLOSE
