// VPxRenderPassImpl: construction and destruction.
#include <openvorla/VPxRenderPassImpl.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxRenderPassImpl::VPxRenderPassImpl() { standin::noteConstructed("VPxRenderPassImpl"); }
VPxRenderPassImpl::~VPxRenderPassImpl() { standin::noteDestroyed("VPxRenderPassImpl"); }

OPENVORLA_NAMESPACE_CLOSE
