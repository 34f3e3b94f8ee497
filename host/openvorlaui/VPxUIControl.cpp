// VPxUIControl: construction, destruction and the widget's flags.
#include <openvorla/VPxUIControl.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

// The stand-in makes no widgets: a flag with a name is taken and dropped.
VStatus takeFlag(const VString &longFlag) {
  if (longFlag.numChars() == 0) return VStatus(VStatus::kInvalidParameter, "A flag needs a name");
  return VStatus::kSuccess;
}

}  // namespace

VPxUIControl::VPxUIControl() { standin::noteConstructed("VPxUIControl"); }
VPxUIControl::~VPxUIControl() { standin::noteDestroyed("VPxUIControl"); }

VStatus VPxUIControl::setWidgetFlag(const VString &longFlag, bool) { return takeFlag(longFlag); }
VStatus VPxUIControl::setWidgetFlag(const VString &longFlag, int) { return takeFlag(longFlag); }
VStatus VPxUIControl::setWidgetFlag(const VString &longFlag, double) { return takeFlag(longFlag); }

VStatus VPxUIControl::setWidgetFlag(const VString &longFlag, const VString &) {
  return takeFlag(longFlag);
}

OPENVORLA_NAMESPACE_CLOSE
