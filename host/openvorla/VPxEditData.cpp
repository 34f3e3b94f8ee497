// VPxEditData: construction and destruction.
#include <openvorla/VPxEditData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxEditData::VPxEditData() { standin::noteConstructed("VPxEditData"); }
VPxEditData::~VPxEditData() { standin::noteDestroyed("VPxEditData"); }

OPENVORLA_NAMESPACE_CLOSE
