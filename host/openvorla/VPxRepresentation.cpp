// VPxRepresentation: construction and destruction.
#include <openvorla/VPxRepresentation.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxRepresentation::VPxRepresentation() { standin::noteConstructed("VPxRepresentation"); }
VPxRepresentation::~VPxRepresentation() { standin::noteDestroyed("VPxRepresentation"); }

OPENVORLA_NAMESPACE_CLOSE
