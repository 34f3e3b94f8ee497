// VPxTexContext: construction and destruction.
#include <openvorla/VPxTexContext.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxTexContext::VPxTexContext() { standin::noteConstructed("VPxTexContext"); }
VPxTexContext::~VPxTexContext() { standin::noteDestroyed("VPxTexContext"); }

OPENVORLA_NAMESPACE_CLOSE
