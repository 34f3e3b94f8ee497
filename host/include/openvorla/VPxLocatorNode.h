// Base class of plug-in locators.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VBoundingBox.h>
#include <openvorla/VColor.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VObject.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VSelectionMask.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxLocatorNode : public VPxNode {
public:
  VPxLocatorNode();
  ~VPxLocatorNode() override;

  VPxNode::Type type() const override;  // kLocatorNode

  // The box the locator draws in, in its own space; not bounded by default.
  virtual bool isBounded() const;
  virtual VBoundingBox boundingBox() const;
  // True keeps the locator out of the host's list of locators.
  virtual bool excludeAsLocator() const;
  // Drawing order: transparent locators after the opaque ones, drawLast
  // ones after everything, always-on-top ones over the scene.
  virtual bool isTransparent() const;
  virtual bool drawLast() const;
  virtual bool isAlwaysOnTop() const;
  // With useClosestPointForSelection, the host selects through closestPoint
  // (the point of the locator nearest the cursor's ray) instead of drawing.
  virtual bool useClosestPointForSelection() const;
  virtual VPoint closestPoint(VPoint cursorRayPoint, VVector cursorRayDir) const;
  // What selects the locator: kSelectLocators by default.
  virtual VSelectionMask getShapeSelectionMask() const;

  // The color the locator is drawn in, active (selected) or not; white and
  // light green until set.
  VColor color(bool active) const;
  void setColor(const VColor &color, bool active);
  // Whether the instance of the locator at path is selected.
  bool isSelected(const VDagPath &path) const;
  static const char *className();

  static VObject underWorldObject;
  static VObject localPosition;
  static VObject localPositionX;
  static VObject localPositionY;
  static VObject localPositionZ;
  static VObject worldPosition;
  static VObject worldPositionX;
  static VObject worldPositionY;
  static VObject worldPositionZ;
  static VObject localScale;
  static VObject localScaleX;
  static VObject localScaleY;
  static VObject localScaleZ;
  static VObject nodeBoundingBox;
  static VObject nodeBoundingBoxMin;
  static VObject nodeBoundingBoxMinX;
  static VObject nodeBoundingBoxMinY;
  static VObject nodeBoundingBoxMinZ;
  static VObject nodeBoundingBoxMax;
  static VObject nodeBoundingBoxMaxX;
  static VObject nodeBoundingBoxMaxY;
  static VObject nodeBoundingBoxMaxZ;
  static VObject nodeBoundingBoxSize;
  static VObject nodeBoundingBoxSizeX;
  static VObject nodeBoundingBoxSizeY;
  static VObject nodeBoundingBoxSizeZ;
  static VObject center;
  static VObject boundingBoxCenterX;
  static VObject boundingBoxCenterY;
  static VObject boundingBoxCenterZ;
  static VObject matrix;
  static VObject inverseMatrix;
  static VObject worldMatrix;
  static VObject worldInverseMatrix;
  static VObject parentMatrix;
  static VObject parentInverseMatrix;
  static VObject visibility;
  static VObject intermediateObject;
  static VObject isTemplated;
  static VObject instObjGroups;
  static VObject objectGroups;
  static VObject objectGrpCompList;
  static VObject objectGroupId;
  static VObject objectGroupColor;
  static VObject useObjectColor;
  static VObject objectColor;

private:
  VColor fColor;
  VColor fActiveColor;
};

OPENVORLA_NAMESPACE_CLOSE
