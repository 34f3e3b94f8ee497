// VPxAssembly: construction and destruction.
#include <openvorla/VPxAssembly.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxAssembly::VPxAssembly() { standin::noteConstructed("VPxAssembly"); }
VPxAssembly::~VPxAssembly() { standin::noteDestroyed("VPxAssembly"); }

OPENVORLA_NAMESPACE_CLOSE
