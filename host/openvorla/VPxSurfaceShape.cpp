// VPxSurfaceShape: the host's default shape behaviour and the static attribute
// objects.
#include <openvorla/VPxSurfaceShape.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxSurfaceShape::VPxSurfaceShape() : fRenderable(true) {
  standin::noteConstructed("VPxSurfaceShape");
}

VPxSurfaceShape::~VPxSurfaceShape() { standin::noteDestroyed("VPxSurfaceShape"); }

VPxNode::Type VPxSurfaceShape::type() const { return kSurfaceShape; }
bool VPxSurfaceShape::isBounded() const { return false; }
VBoundingBox VPxSurfaceShape::boundingBox() const { return VBoundingBox(); }
VObject VPxSurfaceShape::localShapeInAttr() const { return VObject(); }
VObject VPxSurfaceShape::localShapeOutAttr() const { return VObject(); }
VObject VPxSurfaceShape::worldShapeOutAttr() const { return VObject(); }
VObject VPxSurfaceShape::cachedShapeAttr() const { return VObject(); }
VObject VPxSurfaceShape::geometryData() const { return VObject(); }
VObject VPxSurfaceShape::createFullVertexGroup() const { return VObject(); }

VSelectionMask VPxSurfaceShape::getShapeSelectionMask() const {
  return VSelectionMask(VSelectionMask::kSelectPluginShapes);
}

VSelectionMask VPxSurfaceShape::getComponentSelectionMask() const { return VSelectionMask(); }

bool VPxSurfaceShape::match(const VSelectionMask &mask, const VObjectArray &componentList) const {
  VSelectionMask own =
      componentList.length() ? getComponentSelectionMask() : getShapeSelectionMask();
  return own.intersects(mask);
}

VPxSurfaceShape::MatchResult VPxSurfaceShape::matchComponent(const VSelectionList &,
                                                             const VAttributeSpecArray &,
                                                             VSelectionList &) {
  return kMatchNone;
}

bool VPxSurfaceShape::extendSelectionFromComponents(VSelectionList &, VSelectionMask) {
  return false;
}

bool VPxSurfaceShape::acceptsGeometryIterator(bool) { return false; }
bool VPxSurfaceShape::acceptsGeometryIterator(VObject &, bool, bool) { return false; }

VPxGeometryIterator *VPxSurfaceShape::geometryIteratorSetup(VObjectArray &, VObject &, bool) {
  return nullptr;
}

void VPxSurfaceShape::closestPoint(const VPoint &, VPoint &theClosestPoint, double) const {
  theClosestPoint = VPoint();
}

bool VPxSurfaceShape::closestPoint(const VPoint &, const VVector &, VPoint &, VVector &,
                                   bool) const {
  return false;
}

bool VPxSurfaceShape::validateAndSetValue(const VPlug &, const VDataHandle &) { return false; }

// Without a context the plain form decides, as the host does for the normal context.
bool VPxSurfaceShape::validateAndSetValue(const VPlug &plug, const VDataHandle &handle,
                                          const VDGContext &) {
  return validateAndSetValue(plug, handle);
}

void VPxSurfaceShape::componentToPlugs(VObject &, VSelectionList &) const {}
bool VPxSurfaceShape::convertToTweakNodePlug(VPlug &) { return false; }
bool VPxSurfaceShape::deleteComponents(const VObjectArray &, VDoubleArray &) { return false; }
bool VPxSurfaceShape::undeleteComponents(const VObjectArray &, VDoubleArray &) { return false; }

void VPxSurfaceShape::transformUsing(const VMatrix &, const VObjectArray &, PointCachingMode,
                                     VPointArray *) {}

void VPxSurfaceShape::tweakUsing(const VMatrix &, const VObjectArray &, PointCachingMode,
                                 VPointArray *, VArrayDataHandle &) {}

void VPxSurfaceShape::weightedTransformUsing(const VTransformationMatrix &, const VMatrix *,
                                             const VObjectArray &, PointCachingMode, VPointArray *,
                                             const VPlane *) {}

void VPxSurfaceShape::weightedTweakUsing(const VTransformationMatrix &, const VMatrix *,
                                         const VObjectArray &, PointCachingMode, VPointArray *,
                                         const VPlane *, VArrayDataHandle &) {}

bool VPxSurfaceShape::vertexOffsetDirection(VObject &, VVectorArray &, VectorEndPoint, bool) {
  return false;
}

VObject VPxSurfaceShape::newControlPointComponent() { return VObject(); }
VFn::Type VPxSurfaceShape::renderGroupComponentType() const { return VFn::kInvalid; }
VObject VPxSurfaceShape::createFullRenderGroup() const { return VObject(); }
bool VPxSurfaceShape::excludeAsPluginShape() const { return false; }
bool VPxSurfaceShape::canMakeLive() const { return false; }

// The stand-in has no component selection.
bool VPxSurfaceShape::hasActiveComponents() const { return false; }
VObjectArray VPxSurfaceShape::activeComponents() const { return VObjectArray(); }
void VPxSurfaceShape::childChanged(VChildChanged) {}
VMatrix VPxSurfaceShape::getWorldMatrix(VDataBlock &, unsigned int) { return VMatrix(); }
bool VPxSurfaceShape::isRenderable() const { return fRenderable; }

VStatus VPxSurfaceShape::setRenderable(bool renderable) {
  fRenderable = renderable;
  return VStatus::kSuccess;
}

void VPxSurfaceShape::setGeometryDrawDirty(bool) {}
const char *VPxSurfaceShape::className() { return "VPxSurfaceShape"; }

VObject VPxSurfaceShape::mHasHistoryOnCreate =
    standin::makeAttribute("VPxSurfaceShape.mHasHistoryOnCreate");
VObject VPxSurfaceShape::mControlPoints = standin::makeAttribute("VPxSurfaceShape.mControlPoints");
VObject VPxSurfaceShape::mControlValueX = standin::makeAttribute("VPxSurfaceShape.mControlValueX");
VObject VPxSurfaceShape::mControlValueY = standin::makeAttribute("VPxSurfaceShape.mControlValueY");
VObject VPxSurfaceShape::mControlValueZ = standin::makeAttribute("VPxSurfaceShape.mControlValueZ");
VObject VPxSurfaceShape::nodeBoundingBox =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBox");
VObject VPxSurfaceShape::nodeBoundingBoxMin =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMin");
VObject VPxSurfaceShape::nodeBoundingBoxMinX =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMinX");
VObject VPxSurfaceShape::nodeBoundingBoxMinY =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMinY");
VObject VPxSurfaceShape::nodeBoundingBoxMinZ =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMinZ");
VObject VPxSurfaceShape::nodeBoundingBoxMax =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMax");
VObject VPxSurfaceShape::nodeBoundingBoxMaxX =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMaxX");
VObject VPxSurfaceShape::nodeBoundingBoxMaxY =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMaxY");
VObject VPxSurfaceShape::nodeBoundingBoxMaxZ =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxMaxZ");
VObject VPxSurfaceShape::nodeBoundingBoxSize =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxSize");
VObject VPxSurfaceShape::nodeBoundingBoxSizeX =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxSizeX");
VObject VPxSurfaceShape::nodeBoundingBoxSizeY =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxSizeY");
VObject VPxSurfaceShape::nodeBoundingBoxSizeZ =
    standin::makeAttribute("VPxSurfaceShape.nodeBoundingBoxSizeZ");
VObject VPxSurfaceShape::center = standin::makeAttribute("VPxSurfaceShape.center");
VObject VPxSurfaceShape::boundingBoxCenterX =
    standin::makeAttribute("VPxSurfaceShape.boundingBoxCenterX");
VObject VPxSurfaceShape::boundingBoxCenterY =
    standin::makeAttribute("VPxSurfaceShape.boundingBoxCenterY");
VObject VPxSurfaceShape::boundingBoxCenterZ =
    standin::makeAttribute("VPxSurfaceShape.boundingBoxCenterZ");
VObject VPxSurfaceShape::matrix = standin::makeAttribute("VPxSurfaceShape.matrix");
VObject VPxSurfaceShape::inverseMatrix = standin::makeAttribute("VPxSurfaceShape.inverseMatrix");
VObject VPxSurfaceShape::worldMatrix = standin::makeAttribute("VPxSurfaceShape.worldMatrix");
VObject VPxSurfaceShape::worldInverseMatrix =
    standin::makeAttribute("VPxSurfaceShape.worldInverseMatrix");
VObject VPxSurfaceShape::parentMatrix = standin::makeAttribute("VPxSurfaceShape.parentMatrix");
VObject VPxSurfaceShape::parentInverseMatrix =
    standin::makeAttribute("VPxSurfaceShape.parentInverseMatrix");
VObject VPxSurfaceShape::visibility = standin::makeAttribute("VPxSurfaceShape.visibility");
VObject VPxSurfaceShape::intermediateObject =
    standin::makeAttribute("VPxSurfaceShape.intermediateObject");
VObject VPxSurfaceShape::isTemplated = standin::makeAttribute("VPxSurfaceShape.isTemplated");
VObject VPxSurfaceShape::instObjGroups = standin::makeAttribute("VPxSurfaceShape.instObjGroups");
VObject VPxSurfaceShape::objectGroups = standin::makeAttribute("VPxSurfaceShape.objectGroups");
VObject VPxSurfaceShape::objectGrpCompList =
    standin::makeAttribute("VPxSurfaceShape.objectGrpCompList");
VObject VPxSurfaceShape::objectGroupId = standin::makeAttribute("VPxSurfaceShape.objectGroupId");
VObject VPxSurfaceShape::objectGroupColor =
    standin::makeAttribute("VPxSurfaceShape.objectGroupColor");
VObject VPxSurfaceShape::useObjectColor = standin::makeAttribute("VPxSurfaceShape.useObjectColor");
VObject VPxSurfaceShape::objectColor = standin::makeAttribute("VPxSurfaceShape.objectColor");

OPENVORLA_NAMESPACE_CLOSE
