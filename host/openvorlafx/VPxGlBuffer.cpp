// VPxGlBuffer: construction and destruction.
#include <openvorla/VPxGlBuffer.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxGlBuffer::VPxGlBuffer() { standin::noteConstructed("VPxGlBuffer"); }
VPxGlBuffer::~VPxGlBuffer() { standin::noteDestroyed("VPxGlBuffer"); }

OPENVORLA_NAMESPACE_CLOSE
