// VPxComponentShape: the default handling of control points as components.
#include <openvorla/VPxComponentShape.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxComponentShape::VPxComponentShape() { standin::noteConstructed("VPxComponentShape"); }
VPxComponentShape::~VPxComponentShape() { standin::noteDestroyed("VPxComponentShape"); }

// The stand-in's shapes keep no control points: no component names a plug,
// matches or moves, and the shape's own selection answers as a surface shape.
void VPxComponentShape::componentToPlugs(VObject &, VSelectionList &) const {}

VPxSurfaceShape::MatchResult VPxComponentShape::matchComponent(const VSelectionList &,
                                                               const VAttributeSpecArray &,
                                                               VSelectionList &) {
  return kMatchNone;
}

bool VPxComponentShape::match(const VSelectionMask &mask, const VObjectArray &componentList) const {
  return VPxSurfaceShape::match(mask, componentList);
}

VObject VPxComponentShape::createFullVertexGroup() const { return VObject(); }
VObject VPxComponentShape::localShapeInAttr() const { return VObject(); }

void VPxComponentShape::transformUsing(const VMatrix &, const VObjectArray &, PointCachingMode,
                                       VPointArray *) {}

const char *VPxComponentShape::className() { return "VPxComponentShape"; }

OPENVORLA_NAMESPACE_CLOSE
