// VPx3dModelView: construction and destruction.
#include <openvorla/VPx3dModelView.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPx3dModelView::VPx3dModelView() { standin::noteConstructed("VPx3dModelView"); }
VPx3dModelView::~VPx3dModelView() { standin::noteDestroyed("VPx3dModelView"); }

OPENVORLA_NAMESPACE_CLOSE
