// VPxGeometryIterator: construction and destruction.
#include <openvorla/VPxGeometryIterator.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxGeometryIterator::VPxGeometryIterator() { standin::noteConstructed("VPxGeometryIterator"); }
VPxGeometryIterator::~VPxGeometryIterator() { standin::noteDestroyed("VPxGeometryIterator"); }

OPENVORLA_NAMESPACE_CLOSE
