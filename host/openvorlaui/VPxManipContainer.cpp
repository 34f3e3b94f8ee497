// VPxManipContainer: construction and destruction.
#include <openvorla/VPxManipContainer.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxManipContainer::VPxManipContainer() { standin::noteConstructed("VPxManipContainer"); }
VPxManipContainer::~VPxManipContainer() { standin::noteDestroyed("VPxManipContainer"); }

OPENVORLA_NAMESPACE_CLOSE
