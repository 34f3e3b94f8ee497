// VPxGeometryData: construction and destruction.
#include <openvorla/VPxGeometryData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxGeometryData::VPxGeometryData() { standin::noteConstructed("VPxGeometryData"); }
VPxGeometryData::~VPxGeometryData() { standin::noteDestroyed("VPxGeometryData"); }

OPENVORLA_NAMESPACE_CLOSE
