// Base class of plug-in shapes that are drawn and selected as surfaces.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxSurfaceShape : public VPxNode {
public:
  enum PointCachingMode {
    kNoPointCaching,
    kSavePoints,
    kRestorePoints,
    kUpdatePoints,
    kTransformOriginalPoints
  };

  enum VectorEndPoint {
    kNormal,
    kUTangent,
    kVTangent,
    kUVNTriad
  };

  enum MatchResult {
    kMatchOk,
    kMatchNone,
    kMatchTooMany,
    kMatchInvalidName,
    kMatchInvalidAttribute,
    kMatchInvalidAttributeIndex,
    kMatchInvalidAttributeRange,
    kMatchInvalidAttributeDim
  };

  enum VChildChanged {
    kObjectChanged,
    kBoundingBoxChanged
  };

  VPxSurfaceShape();
  ~VPxSurfaceShape() override;

  static VObject mHasHistoryOnCreate;
  static VObject mControlPoints;
  static VObject mControlValueX;
  static VObject mControlValueY;
  static VObject mControlValueZ;
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
