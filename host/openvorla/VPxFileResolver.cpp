// VPxFileResolver: construction and destruction.
#include <openvorla/VPxFileResolver.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxFileResolver::VPxFileResolver() { standin::noteConstructed("VPxFileResolver"); }
VPxFileResolver::~VPxFileResolver() { standin::noteDestroyed("VPxFileResolver"); }

OPENVORLA_NAMESPACE_CLOSE
