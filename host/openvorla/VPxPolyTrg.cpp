// VPxPolyTrg: construction and destruction.
#include <openvorla/VPxPolyTrg.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxPolyTrg::VPxPolyTrg() { standin::noteConstructed("VPxPolyTrg"); }
VPxPolyTrg::~VPxPolyTrg() { standin::noteDestroyed("VPxPolyTrg"); }

OPENVORLA_NAMESPACE_CLOSE
