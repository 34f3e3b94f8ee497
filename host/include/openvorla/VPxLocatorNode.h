// Base class of plug-in locators.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxLocatorNode : public VPxNode {
public:
  VPxLocatorNode();
  ~VPxLocatorNode() override;

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
};

OPENVORLA_NAMESPACE_CLOSE
