// VPxUITableControl: construction and destruction.
#include <openvorla/VPxUITableControl.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxUITableControl::VPxUITableControl() { standin::noteConstructed("VPxUITableControl"); }
VPxUITableControl::~VPxUITableControl() { standin::noteDestroyed("VPxUITableControl"); }

OPENVORLA_NAMESPACE_CLOSE
