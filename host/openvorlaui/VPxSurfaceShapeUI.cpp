// VPxSurfaceShapeUI: construction and destruction.
#include <openvorla/VPxSurfaceShapeUI.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxSurfaceShapeUI::VPxSurfaceShapeUI() { standin::noteConstructed("VPxSurfaceShapeUI"); }
VPxSurfaceShapeUI::~VPxSurfaceShapeUI() { standin::noteDestroyed("VPxSurfaceShapeUI"); }

OPENVORLA_NAMESPACE_CLOSE
