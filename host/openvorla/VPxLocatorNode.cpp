// VPxLocatorNode: construction and the static attribute objects.
#include <openvorla/VPxLocatorNode.h>


#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include "BaseAttributes.h"

OPENVORLA_NAMESPACE_OPEN

VPxLocatorNode::VPxLocatorNode() : fColor(1.0f, 1.0f, 1.0f), fActiveColor(0.26f, 1.0f, 0.64f) {
  standin::noteConstructed("VPxLocatorNode");
}

VPxLocatorNode::~VPxLocatorNode() { standin::noteDestroyed("VPxLocatorNode"); }

VPxNode::Type VPxLocatorNode::type() const { return kLocatorNode; }
bool VPxLocatorNode::isBounded() const { return false; }
VBoundingBox VPxLocatorNode::boundingBox() const { return VBoundingBox(); }
bool VPxLocatorNode::excludeAsLocator() const { return false; }
bool VPxLocatorNode::isTransparent() const { return false; }
bool VPxLocatorNode::drawLast() const { return false; }
bool VPxLocatorNode::isAlwaysOnTop() const { return false; }
bool VPxLocatorNode::useClosestPointForSelection() const { return false; }
VPoint VPxLocatorNode::closestPoint(VPoint, VVector) const { return VPoint(); }

VSelectionMask VPxLocatorNode::getShapeSelectionMask() const {
  return VSelectionMask(VSelectionMask::kSelectLocators);
}

VColor VPxLocatorNode::color(bool active) const { return active ? fActiveColor : fColor; }
void VPxLocatorNode::setColor(const VColor &color, bool active) {
  (active ? fActiveColor : fColor) = color;
}

// The stand-in has no selection of instances.
bool VPxLocatorNode::isSelected(const VDagPath &) const { return false; }
const char *VPxLocatorNode::className() { return "VPxLocatorNode"; }

VObject VPxLocatorNode::underWorldObject =
    standin::makeAttribute("VPxLocatorNode.underWorldObject");
VObject VPxLocatorNode::localPosition = standin::bases::triple("localPosition", "lp", 0.0);
VObject VPxLocatorNode::localPositionX = standin::makeAttribute("VPxLocatorNode.localPositionX");
VObject VPxLocatorNode::localPositionY = standin::makeAttribute("VPxLocatorNode.localPositionY");
VObject VPxLocatorNode::localPositionZ = standin::makeAttribute("VPxLocatorNode.localPositionZ");
VObject VPxLocatorNode::worldPosition = standin::makeAttribute("VPxLocatorNode.worldPosition");
VObject VPxLocatorNode::worldPositionX = standin::makeAttribute("VPxLocatorNode.worldPositionX");
VObject VPxLocatorNode::worldPositionY = standin::makeAttribute("VPxLocatorNode.worldPositionY");
VObject VPxLocatorNode::worldPositionZ = standin::makeAttribute("VPxLocatorNode.worldPositionZ");
VObject VPxLocatorNode::localScale = standin::bases::triple("localScale", "ls", 1.0);
VObject VPxLocatorNode::localScaleX = standin::makeAttribute("VPxLocatorNode.localScaleX");
VObject VPxLocatorNode::localScaleY = standin::makeAttribute("VPxLocatorNode.localScaleY");
VObject VPxLocatorNode::localScaleZ = standin::makeAttribute("VPxLocatorNode.localScaleZ");
VObject VPxLocatorNode::nodeBoundingBox = standin::makeAttribute("VPxLocatorNode.nodeBoundingBox");
VObject VPxLocatorNode::nodeBoundingBoxMin =
    standin::bases::triple("nodeBoundingBoxMin", "nbim", 0.0);
VObject VPxLocatorNode::nodeBoundingBoxMinX =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxMinX");
VObject VPxLocatorNode::nodeBoundingBoxMinY =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxMinY");
VObject VPxLocatorNode::nodeBoundingBoxMinZ =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxMinZ");
VObject VPxLocatorNode::nodeBoundingBoxMax =
    standin::bases::triple("nodeBoundingBoxMax", "nbia", 0.0);
VObject VPxLocatorNode::nodeBoundingBoxMaxX =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxMaxX");
VObject VPxLocatorNode::nodeBoundingBoxMaxY =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxMaxY");
VObject VPxLocatorNode::nodeBoundingBoxMaxZ =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxMaxZ");
VObject VPxLocatorNode::nodeBoundingBoxSize =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxSize");
VObject VPxLocatorNode::nodeBoundingBoxSizeX =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxSizeX");
VObject VPxLocatorNode::nodeBoundingBoxSizeY =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxSizeY");
VObject VPxLocatorNode::nodeBoundingBoxSizeZ =
    standin::makeAttribute("VPxLocatorNode.nodeBoundingBoxSizeZ");
VObject VPxLocatorNode::center = standin::makeAttribute("VPxLocatorNode.center");
VObject VPxLocatorNode::boundingBoxCenterX =
    standin::makeAttribute("VPxLocatorNode.boundingBoxCenterX");
VObject VPxLocatorNode::boundingBoxCenterY =
    standin::makeAttribute("VPxLocatorNode.boundingBoxCenterY");
VObject VPxLocatorNode::boundingBoxCenterZ =
    standin::makeAttribute("VPxLocatorNode.boundingBoxCenterZ");
VObject VPxLocatorNode::matrix = standin::makeAttribute("VPxLocatorNode.matrix");
VObject VPxLocatorNode::inverseMatrix = standin::makeAttribute("VPxLocatorNode.inverseMatrix");
VObject VPxLocatorNode::worldMatrix = standin::makeAttribute("VPxLocatorNode.worldMatrix");
VObject VPxLocatorNode::worldInverseMatrix =
    standin::makeAttribute("VPxLocatorNode.worldInverseMatrix");
VObject VPxLocatorNode::parentMatrix = standin::makeAttribute("VPxLocatorNode.parentMatrix");
VObject VPxLocatorNode::parentInverseMatrix =
    standin::makeAttribute("VPxLocatorNode.parentInverseMatrix");
VObject VPxLocatorNode::visibility = standin::makeAttribute("VPxLocatorNode.visibility");
VObject VPxLocatorNode::intermediateObject =
    standin::makeAttribute("VPxLocatorNode.intermediateObject");
VObject VPxLocatorNode::isTemplated = standin::makeAttribute("VPxLocatorNode.isTemplated");
VObject VPxLocatorNode::instObjGroups = standin::makeAttribute("VPxLocatorNode.instObjGroups");
VObject VPxLocatorNode::objectGroups = standin::makeAttribute("VPxLocatorNode.objectGroups");
VObject VPxLocatorNode::objectGrpCompList =
    standin::makeAttribute("VPxLocatorNode.objectGrpCompList");
VObject VPxLocatorNode::objectGroupId = standin::makeAttribute("VPxLocatorNode.objectGroupId");
VObject VPxLocatorNode::objectGroupColor =
    standin::makeAttribute("VPxLocatorNode.objectGroupColor");
VObject VPxLocatorNode::useObjectColor = standin::makeAttribute("VPxLocatorNode.useObjectColor");
VObject VPxLocatorNode::objectColor = standin::makeAttribute("VPxLocatorNode.objectColor");

OPENVORLA_NAMESPACE_CLOSE
