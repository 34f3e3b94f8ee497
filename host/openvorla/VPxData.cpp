// VPxData: construction and destruction.
#include <openvorla/VPxData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxData::VPxData() { standin::noteConstructed("VPxData"); }
VPxData::~VPxData() { standin::noteDestroyed("VPxData"); }

OPENVORLA_NAMESPACE_CLOSE
