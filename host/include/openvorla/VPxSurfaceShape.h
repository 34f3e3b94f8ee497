// Base class of plug-in shapes that are drawn and selected as surfaces.
//
// The host's defaults describe a shape without geometry of its own: no box,
// no components, no iterators; it is selected as a plug-in shape.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VBoundingBox.h>
#include <openvorla/VDGContext.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VFn.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPointArray.h>
#include <openvorla/VPxGeometryIterator.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VSelectionList.h>
#include <openvorla/VSelectionMask.h>
#include <openvorla/VTransformationMatrix.h>
#include <openvorla/VTypes.h>
#include <openvorla/VVector.h>
#include <openvorla/VVectorArray.h>

OPENVORLA_NAMESPACE_OPEN

class VArrayDataHandle;
class VPlane;

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

  // The point of the shape closest to toThisPoint; the shape's origin by
  // default. The ray form finds where the ray meets the shape, or with
  // findClosestOnMiss the point closest to the ray; false when none is found.
  virtual void closestPoint(const VPoint &toThisPoint, VPoint &theClosestPoint,
                            double tolerance = 0.1) const;
  virtual bool closestPoint(const VPoint &raySource, const VVector &rayDirection,
                            VPoint &closestPoint, VVector &closestNormal,
                            bool findClosestOnMiss) const;

  // Sets a value that the shape keeps itself (control points and the like)
  // from handle; false: the host sets the plug's value.
  virtual bool validateAndSetValue(const VPlug &plug, const VDataHandle &handle);
  virtual bool validateAndSetValue(const VPlug &plug, const VDataHandle &handle,
                                   const VDGContext &context);

  // The plugs of the component's elements, added to selectionList.
  virtual void componentToPlugs(VObject &component, VSelectionList &selectionList) const;
  // Turns a control-point plug into the plug of the tweak that moves it;
  // false: the plug stays as it is.
  virtual bool convertToTweakNodePlug(VPlug &plug);
  // Removes the components, recording in undoInfo how to put them back;
  // false: the shape cannot delete components.
  virtual bool deleteComponents(const VObjectArray &componentList, VDoubleArray &undoInfo);
  virtual bool undeleteComponents(const VObjectArray &componentList, VDoubleArray &undoInfo);

  // Moves the components (every control point for an empty list) by the
  // matrix, saving or restoring their positions in pointCache as cachingMode
  // says. Nothing moves by default.
  virtual void transformUsing(const VMatrix &mat, const VObjectArray &componentList,
                              PointCachingMode cachingMode = kNoPointCaching,
                              VPointArray *pointCache = NULL);
  // The same through the tweaks of the shape's control points in handle.
  virtual void tweakUsing(const VMatrix &mat, const VObjectArray &componentList,
                          PointCachingMode cachingMode, VPointArray *pointCache,
                          VArrayDataHandle &handle);
  // Soft moves: each component by its weight, in space when given, keeping
  // the points on freezePlane where it is given.
  virtual void weightedTransformUsing(const VTransformationMatrix &xform, const VMatrix *space,
                                      const VObjectArray &componentList,
                                      PointCachingMode cachingMode, VPointArray *pointCache,
                                      const VPlane *freezePlane);
  virtual void weightedTweakUsing(const VTransformationMatrix &xform, const VMatrix *space,
                                  const VObjectArray &componentList, PointCachingMode cachingMode,
                                  VPointArray *pointCache, const VPlane *freezePlane,
                                  VArrayDataHandle &handle);

  // The directions in which the component's vertices move when offset along
  // their normal or tangents; false: the shape does not support it.
  virtual bool vertexOffsetDirection(VObject &component, VVectorArray &direction,
                                     VectorEndPoint mode = kNormal, bool normalize = true);
  // The component of a new control point; the null object by default.
  virtual VObject newControlPointComponent();
  // The kind of component that groups the shape for rendering, and the
  // component holding all of them; kInvalid and the null object by default.
  virtual VFn::Type renderGroupComponentType() const;
  virtual VObject createFullRenderGroup() const;
  // True keeps the shape out of the host's list of plug-in shapes.
  virtual bool excludeAsPluginShape() const;
  // Whether the shape can be made the live surface that tools snap to.
  virtual bool canMakeLive() const;

  // Whether any component of the shape is active (highlighted), and which.
  bool hasActiveComponents() const;
  VObjectArray activeComponents() const;
  // Tells the host that the shape's geometry, or only its box, changed.
  void childChanged(VChildChanged state = kObjectChanged);
  // The world matrix of the instance instanceGeom, from the block.
  VMatrix getWorldMatrix(VDataBlock &block, unsigned int instanceGeom);
  // Whether the host renders the shape; true by default.
  bool isRenderable() const;
  VStatus setRenderable(bool renderable);
  // Asks the host to draw the shape again, with new topology or without.
  void setGeometryDrawDirty(bool topologyChanged = true);
  static const char *className();

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

private:
  bool fRenderable;
};

OPENVORLA_NAMESPACE_CLOSE
