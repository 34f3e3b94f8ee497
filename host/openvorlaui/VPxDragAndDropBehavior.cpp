// VPxDragAndDropBehavior: construction and destruction.
#include <openvorla/VPxDragAndDropBehavior.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxDragAndDropBehavior::VPxDragAndDropBehavior() {
  standin::noteConstructed("VPxDragAndDropBehavior");
}
VPxDragAndDropBehavior::~VPxDragAndDropBehavior() {
  standin::noteDestroyed("VPxDragAndDropBehavior");
}

OPENVORLA_NAMESPACE_CLOSE
