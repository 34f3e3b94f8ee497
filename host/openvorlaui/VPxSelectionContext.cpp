// VPxSelectionContext: construction and destruction.
#include <openvorla/VPxSelectionContext.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxSelectionContext::VPxSelectionContext() { standin::noteConstructed("VPxSelectionContext"); }
VPxSelectionContext::~VPxSelectionContext() { standin::noteDestroyed("VPxSelectionContext"); }

OPENVORLA_NAMESPACE_CLOSE
