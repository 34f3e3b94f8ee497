// VPxSurfaceShapeUI: the host's default UI, which draws and selects nothing.
#include <openvorla/VPxSurfaceShapeUI.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxSurfaceShapeUI::VPxSurfaceShapeUI() : fShape(nullptr) {
  standin::noteConstructed("VPxSurfaceShapeUI");
}

VPxSurfaceShapeUI::~VPxSurfaceShapeUI() { standin::noteDestroyed("VPxSurfaceShapeUI"); }

void VPxSurfaceShapeUI::getDrawRequests(const VDrawInfo &, bool, VDrawRequestQueue &) {}
void VPxSurfaceShapeUI::draw(const VDrawRequest &, V3dView &) const {}

bool VPxSurfaceShapeUI::select(VSelectInfo &, VSelectionList &, VPointArray &) const {
  return false;
}

bool VPxSurfaceShapeUI::snap(VSelectInfo &) const { return false; }
bool VPxSurfaceShapeUI::canDrawUV() const { return false; }
void VPxSurfaceShapeUI::drawUV(V3dView &, const VTextureEditorDrawInfo &) const {}

bool VPxSurfaceShapeUI::selectUV(V3dView &, SelectionType, int, int, int, int, bool,
                                 VSelectionList &) const {
  return false;
}

VPxSurfaceShape *VPxSurfaceShapeUI::surfaceShape() const { return fShape; }

// The stand-in draws no views, so it makes no UI objects for its shapes.
VPxSurfaceShapeUI *VPxSurfaceShapeUI::surfaceShapeUI(const VDagPath &) { return nullptr; }

void VPxSurfaceShapeUI::getDrawData(const void *, VDrawData &) const {}

VStatus VPxSurfaceShapeUI::getMaterials(VMaterialArray &) const {
  return VStatus(VStatus::kNotFound, "The UI is not attached to a shape");
}

bool VPxSurfaceShapeUI::isTemplated() const { return false; }
bool VPxSurfaceShapeUI::isSelected() const { return false; }

OPENVORLA_NAMESPACE_CLOSE
