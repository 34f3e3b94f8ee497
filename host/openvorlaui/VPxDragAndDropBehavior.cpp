// VPxDragAndDropBehavior: the host's default behaviour, which handles nothing.
#include <openvorla/VPxDragAndDropBehavior.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxDragAndDropBehavior::VPxDragAndDropBehavior() {
  standin::noteConstructed("VPxDragAndDropBehavior");
}

VPxDragAndDropBehavior::~VPxDragAndDropBehavior() {
  standin::noteDestroyed("VPxDragAndDropBehavior");
}

const char *VPxDragAndDropBehavior::className() { return "VPxDragAndDropBehavior"; }

bool VPxDragAndDropBehavior::shouldBeUsedFor(VObject &, VObject &, VPlug &, VPlug &) {
  return false;
}

VStatus VPxDragAndDropBehavior::connectAttrToAttr(VPlug &, VPlug &, bool) {
  return VStatus::kNotImplemented;
}

VStatus VPxDragAndDropBehavior::connectAttrToNode(VPlug &, VObject &, bool) {
  return VStatus::kNotImplemented;
}

VStatus VPxDragAndDropBehavior::connectNodeToAttr(VObject &, VPlug &, bool) {
  return VStatus::kNotImplemented;
}

VStatus VPxDragAndDropBehavior::connectNodeToNode(VObject &, VObject &, bool) {
  return VStatus::kNotImplemented;
}

OPENVORLA_NAMESPACE_CLOSE
