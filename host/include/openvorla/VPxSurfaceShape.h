// Base class of plug-in shapes that are drawn and selected as surfaces.
//
// The host's defaults describe a shape without geometry of its own: no box,
// no components, no iterators; it is selected as a plug-in shape.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VBoundingBox.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPxGeometryIterator.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VSelectionList.h>
#include <openvorla/VSelectionMask.h>
#include <openvorla/VTypes.h>

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

  VPxNode::Type type() const override;  // kSurfaceShape

  virtual bool isBounded() const;
  virtual VBoundingBox boundingBox() const;
  // The attributes through which the shape's geometry flows, and its
  // geometry as data; the null object by default.
  virtual VObject localShapeInAttr() const;
  virtual VObject localShapeOutAttr() const;
  virtual VObject worldShapeOutAttr() const;
  virtual VObject cachedShapeAttr() const;
  virtual VObject geometryData() const;
  // The component that stands for every vertex; the null object by default.
  virtual VObject createFullVertexGroup() const;

  // What selects the shape and its components: kSelectPluginShapes, and no
  // components, by default.
  virtual VSelectionMask getShapeSelectionMask() const;
  virtual VSelectionMask getComponentSelectionMask() const;
  // Whether the shape answers to a selection with the mask: through the
  // shape's mask without components, through the components' mask with them.
  virtual bool match(const VSelectionMask &mask, const VObjectArray &componentList) const;
  // The components that the item and the attribute specification name, added
  // to list; kMatchNone by default.
  virtual MatchResult matchComponent(const VSelectionList &item, const VAttributeSpecArray &spec,
                                     VSelectionList &list);
  // Adds to input the components of the mask's kind that the selected
  // components imply; false by default: nothing is added.
  virtual bool extendSelectionFromComponents(VSelectionList &input, VSelectionMask mask);

  // Geometry iterators over the shape; none by default.
  virtual bool acceptsGeometryIterator(bool writeable = true);
  virtual bool acceptsGeometryIterator(VObject &component, bool writeable = true,
                                       bool forReadOnly = false);
  virtual VPxGeometryIterator *geometryIteratorSetup(VObjectArray &componentList,
                                                     VObject &components,
                                                     bool forReadOnly = false);

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
