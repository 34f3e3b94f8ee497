// VPxContext: construction and destruction.
#include <openvorla/VPxContext.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxContext::VPxContext() { standin::noteConstructed("VPxContext"); }
VPxContext::~VPxContext() { standin::noteDestroyed("VPxContext"); }

OPENVORLA_NAMESPACE_CLOSE
