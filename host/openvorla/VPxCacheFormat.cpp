// VPxCacheFormat: construction and destruction.
#include <openvorla/VPxCacheFormat.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxCacheFormat::VPxCacheFormat() { standin::noteConstructed("VPxCacheFormat"); }
VPxCacheFormat::~VPxCacheFormat() { standin::noteDestroyed("VPxCacheFormat"); }

OPENVORLA_NAMESPACE_CLOSE
