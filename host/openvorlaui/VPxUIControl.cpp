// VPxUIControl: construction and destruction.
#include <openvorla/VPxUIControl.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxUIControl::VPxUIControl() { standin::noteConstructed("VPxUIControl"); }
VPxUIControl::~VPxUIControl() { standin::noteDestroyed("VPxUIControl"); }
const char *VPxUIControl::className() { return "VPxUIControl"; }

OPENVORLA_NAMESPACE_CLOSE
