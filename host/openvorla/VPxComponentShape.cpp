// VPxComponentShape: construction and destruction.
#include <openvorla/VPxComponentShape.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxComponentShape::VPxComponentShape() { standin::noteConstructed("VPxComponentShape"); }
VPxComponentShape::~VPxComponentShape() { standin::noteDestroyed("VPxComponentShape"); }

OPENVORLA_NAMESPACE_CLOSE
