// Base class of plug-in transform nodes.
//
// A transform keeps its components in its transformation matrix, which it
// makes with createTransformationMatrix() when first asked for it. The host's
// getters and setters read and change that matrix; the forms with a context
// behave as the plain ones, since the stand-in keeps no animation. The
// checkAndSet* members set a component as the host does when a plug is set:
// through the locks, then the limits, of that component.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VBoundingBox.h>
#include <openvorla/VDGContext.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>
#include <openvorla/VEulerRotation.h>
#include <openvorla/VFnTransform.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VPxTransformationMatrix.h>
#include <openvorla/VQuaternion.h>
#include <openvorla/VSpace.h>
#include <openvorla/VStatus.h>
#include <openvorla/VTransformationMatrix.h>
#include <openvorla/VVector.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxTransform : public VPxNode {
public:
  VPxTransform();
  ~VPxTransform() override;

  VPxNode::Type type() const override;  // kTransformNode

  // A new matrix for the transform to keep, owned by the transform; a plain
  // VPxTransformationMatrix by default.
  virtual VPxTransformationMatrix *createTransformationMatrix();
  virtual VPxTransformationMatrix &transformationMatrix() const;
  // Whether the transform has a box of its own to draw; false, and the empty box.
  virtual bool isBounded() const;
  virtual VBoundingBox boundingBox() const;
  // Whether the host treats the node as a plain transform; true.
  virtual bool treatAsTransform() const;

  // Back to the identity (the data block form) or to the components of a matrix.
  virtual void resetTransformation(VDataBlock &block);
  void resetTransformation(const VMatrix &matrix);
  // Puts the components of the local transformation into xform: the ones the
  // transform keeps, by default. kInvalidParameter for null.
  virtual VStatus computeLocalTransformation(VPxTransformationMatrix *xform, VDataBlock &block);
  // A value set on one of the transform's plugs; kUnknownParameter by
  // default: the host sets it.
  virtual VStatus validateAndSetValue(const VPlug &plug, const VDataHandle &handle);
  virtual VStatus validateAndSetValue(const VPlug &plug, const VDataHandle &handle,
                                      const VDGContext &context);
  // Brings the matrix attributes up to date with the components: all of
  // them, or those that attr affects; kSuccess by default, as the stand-in
  // computes them when they are read.
  virtual VStatus updateMatrixAttrs(const VDGContext &context);
  virtual VStatus updateMatrixAttrs(VObject &attr, const VDGContext &context);
  // A duplicate takes the components and the limits of the original.
  void copyInternalData(VPxNode *node) override;

  virtual VMatrix getMatrix(VStatus *ReturnStatus = NULL);
  virtual VMatrix getMatrix(const VDGContext &context, VStatus *ReturnStatus = NULL);
  virtual VMatrix getMatrixInverse(VStatus *ReturnStatus = NULL);
  virtual VMatrix getMatrixInverse(const VDGContext &context, VStatus *ReturnStatus = NULL);

  virtual VVector getTranslation(VSpace::Space space = VSpace::kTransform,
                                 VStatus *ReturnStatus = NULL);
  virtual VVector getTranslation(VSpace::Space space, const VDGContext &context,
                                 VStatus *ReturnStatus = NULL);
  virtual VStatus translateTo(const VVector &vector, VSpace::Space space = VSpace::kTransform);
  virtual VStatus translateTo(const VVector &vector, VSpace::Space space,
                              const VDGContext &context);
  virtual VStatus translateBy(const VVector &vector, VSpace::Space space = VSpace::kTransform);
  virtual VStatus translateBy(const VVector &vector, VSpace::Space space,
                              const VDGContext &context);

  virtual VQuaternion getRotation(VSpace::Space space = VSpace::kTransform,
                                  VStatus *ReturnStatus = NULL);
  virtual VQuaternion getRotation(VSpace::Space space, const VDGContext &context,
                                  VStatus *ReturnStatus = NULL);
  virtual VEulerRotation getEulerRotation(VSpace::Space space = VSpace::kTransform,
                                          VStatus *ReturnStatus = NULL);
  virtual VEulerRotation getEulerRotation(VSpace::Space space, const VDGContext &context,
                                          VStatus *ReturnStatus = NULL);
  virtual VStatus rotateTo(const VQuaternion &q, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateTo(const VQuaternion &q, VSpace::Space space, const VDGContext &context);
  virtual VStatus rotateTo(const VEulerRotation &e, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateTo(const VEulerRotation &e, VSpace::Space space,
                           const VDGContext &context);
  virtual VStatus rotateBy(const VQuaternion &q, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateBy(const VQuaternion &q, VSpace::Space space, const VDGContext &context);
  virtual VStatus rotateBy(const VEulerRotation &e, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateBy(const VEulerRotation &e, VSpace::Space space,
                           const VDGContext &context);
  virtual VTransformationMatrix::RotationOrder getRotationOrder();
  virtual VTransformationMatrix::RotationOrder getRotationOrder(const VDGContext &context);
  // reorder: the rotation is kept and its angles change.
  virtual VStatus setRotationOrder(VTransformationMatrix::RotationOrder order, bool reorder = true);
  virtual VStatus setRotationOrder(VTransformationMatrix::RotationOrder order, bool reorder,
                                   const VDGContext &context);

  virtual VVector getScale(VSpace::Space space = VSpace::kTransform, VStatus *ReturnStatus = NULL);
  virtual VVector getScale(VSpace::Space space, const VDGContext &context,
                           VStatus *ReturnStatus = NULL);
  virtual VStatus scaleTo(const VVector &scale, VSpace::Space space = VSpace::kTransform);
  virtual VStatus scaleTo(const VVector &scale, VSpace::Space space, const VDGContext &context);
  virtual VStatus scaleBy(const VVector &scale, VSpace::Space space = VSpace::kTransform);
  virtual VStatus scaleBy(const VVector &scale, VSpace::Space space, const VDGContext &context);
  virtual VVector getShear(VSpace::Space space = VSpace::kTransform, VStatus *ReturnStatus = NULL);
  virtual VVector getShear(VSpace::Space space, const VDGContext &context,
                           VStatus *ReturnStatus = NULL);
  virtual VStatus shearTo(const VVector &shear, VSpace::Space space = VSpace::kTransform);
  virtual VStatus shearTo(const VVector &shear, VSpace::Space space, const VDGContext &context);
  virtual VStatus shearBy(const VVector &shear, VSpace::Space space = VSpace::kTransform);
  virtual VStatus shearBy(const VVector &shear, VSpace::Space space, const VDGContext &context);

  // balance: the other components change so that the matrix does not.
  virtual VPoint getScalePivot(VSpace::Space space = VSpace::kTransform,
                               VStatus *ReturnStatus = NULL);
  virtual VPoint getScalePivot(VSpace::Space space, const VDGContext &context,
                               VStatus *ReturnStatus = NULL);
  virtual VStatus setScalePivot(const VPoint &pivot, VSpace::Space space = VSpace::kTransform,
                                bool balance = true);
  virtual VStatus setScalePivot(const VPoint &pivot, VSpace::Space space, bool balance,
                                const VDGContext &context);
  virtual VVector getScalePivotTranslation(VSpace::Space space = VSpace::kTransform,
                                           VStatus *ReturnStatus = NULL);
  virtual VVector getScalePivotTranslation(VSpace::Space space, const VDGContext &context,
                                           VStatus *ReturnStatus = NULL);
  virtual VStatus setScalePivotTranslation(const VVector &vector,
                                           VSpace::Space space = VSpace::kTransform);
  virtual VStatus setScalePivotTranslation(const VVector &vector, VSpace::Space space,
                                           const VDGContext &context);
  virtual VPoint getRotatePivot(VSpace::Space space = VSpace::kTransform,
                                VStatus *ReturnStatus = NULL);
  virtual VPoint getRotatePivot(VSpace::Space space, const VDGContext &context,
                                VStatus *ReturnStatus = NULL);
  virtual VStatus setRotatePivot(const VPoint &pivot, VSpace::Space space = VSpace::kTransform,
                                 bool balance = true);
  virtual VStatus setRotatePivot(const VPoint &pivot, VSpace::Space space, bool balance,
                                 const VDGContext &context);
  virtual VVector getRotatePivotTranslation(VSpace::Space space = VSpace::kTransform,
                                            VStatus *ReturnStatus = NULL);
  virtual VVector getRotatePivotTranslation(VSpace::Space space, const VDGContext &context,
                                            VStatus *ReturnStatus = NULL);
  virtual VStatus setRotatePivotTranslation(const VVector &vector,
                                            VSpace::Space space = VSpace::kTransform);
  virtual VStatus setRotatePivotTranslation(const VVector &vector, VSpace::Space space,
                                            const VDGContext &context);
  virtual VQuaternion getRotateOrientation(VSpace::Space space = VSpace::kTransform,
                                           VStatus *ReturnStatus = NULL);
  virtual VQuaternion getRotateOrientation(VSpace::Space space, const VDGContext &context,
                                           VStatus *ReturnStatus = NULL);
  virtual VStatus setRotateOrientation(const VQuaternion &q,
                                       VSpace::Space space = VSpace::kTransform,
                                       bool balance = true);
  virtual VStatus setRotateOrientation(const VQuaternion &q, VSpace::Space space, bool balance,
                                       const VDGContext &context);

  virtual VStatus checkAndSetTranslation(VDataBlock &block, const VPlug &plug,
                                         const VVector &translation, VSpace::Space space);
  virtual VStatus checkAndSetRotation(VDataBlock &block, const VPlug &plug,
                                      const VEulerRotation &rotation, VSpace::Space space);
  virtual VStatus checkAndSetScale(VDataBlock &block, const VPlug &plug, const VVector &scale,
                                   VSpace::Space space);
  virtual VStatus checkAndSetShear(VDataBlock &block, const VPlug &plug, const VVector &shear,
                                   VSpace::Space space);
  virtual VStatus checkAndSetRotateOrientation(VDataBlock &block, const VPlug &plug,
                                               const VEulerRotation &orientation,
                                               VSpace::Space space, bool balance);
  virtual VStatus checkAndSetRotatePivot(VDataBlock &block, const VPlug &plug,
                                         const VPoint &pivot, VSpace::Space space, bool balance);
  virtual VStatus checkAndSetRotatePivotTranslation(VDataBlock &block, const VPlug &plug,
                                                    const VVector &translation,
                                                    VSpace::Space space);
  virtual VStatus checkAndSetScalePivot(VDataBlock &block, const VPlug &plug,
                                        const VPoint &pivot, VSpace::Space space);
  virtual VStatus checkAndSetScalePivotTranslation(VDataBlock &block, const VPlug &plug,
                                                   const VVector &translation,
                                                   VSpace::Space space);

  VPxTransformationMatrix *transformationMatrixPtr() const;
  // Whether the matrix was made yet; it is made when first asked for.
  bool hasTransformationMatrix() const;
  // The limits of the components. The host's defaults, all disabled: -1 to 1
  // for translation and scale, -2 pi to 2 pi for rotation. A limit that
  // would pass the other limit of its axis is refused with kInvalidParameter.
  bool isLimited(VFnTransform::LimitType type, VStatus *ReturnStatus = NULL) const;
  double limitValue(VFnTransform::LimitType type, VStatus *ReturnStatus = NULL) const;
  VStatus setLimit(VFnTransform::LimitType type, double value);
  VStatus enableLimit(VFnTransform::LimitType type, bool flag);
  // Disables every limit, keeping its value; or back to the host's defaults.
  VStatus clearLimits();
  VStatus resetLimits();
  // The values and the states of the other transform's limits.
  VStatus copyLimits(const VPxTransform &other);

  // Makes the host call validateAndSetValue() when the attribute is set.
  static void mustCallValidateAndSet(VObject &attr);
  // Whether transforms may hold matrices with shear or non-uniform scale
  // under rotation; true by default.
  static VStatus setNonAffineMatricesEnabled(bool enabled);
  static bool isNonAffineMatricesEnabled(VStatus *ReturnStatus = NULL);
  static const char *className();

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
  static VObject ghosting;
  static VObject instObjGroups;
  static VObject objectGroups;
  static VObject objectGrpCompList;
  static VObject objectGroupId;
  static VObject objectGroupColor;
  static VObject useObjectColor;
  static VObject objectColor;
  static VObject drawOverride;
  static VObject overrideDisplayType;
  static VObject overrideLevelOfDetail;
  static VObject overrideShading;
  static VObject overrideTexturing;
  static VObject overridePlayback;
  static VObject overrideEnabled;
  static VObject overrideVisibility;
  static VObject overrideColor;
  static VObject lodVisibility;
  static VObject renderInfo;
  static VObject identification;
  static VObject layerRenderable;
  static VObject layerOverrideColor;
  static VObject renderLayerInfo;
  static VObject renderLayerId;
  static VObject renderLayerRenderable;
  static VObject renderLayerColor;
  static VObject translate;
  static VObject translateX;
  static VObject translateY;
  static VObject translateZ;
  static VObject rotate;
  static VObject rotateX;
  static VObject rotateY;
  static VObject rotateZ;
  static VObject rotateOrder;
  static VObject scale;
  static VObject scaleX;
  static VObject scaleY;
  static VObject scaleZ;
  static VObject shear;
  static VObject shearXY;
  static VObject shearXZ;
  static VObject shearYZ;
  static VObject rotatePivot;
  static VObject rotatePivotX;
  static VObject rotatePivotY;
  static VObject rotatePivotZ;
  static VObject rotatePivotTranslate;
  static VObject rotatePivotTranslateX;
  static VObject rotatePivotTranslateY;
  static VObject rotatePivotTranslateZ;
  static VObject scalePivot;
  static VObject scalePivotX;
  static VObject scalePivotY;
  static VObject scalePivotZ;
  static VObject scalePivotTranslate;
  static VObject scalePivotTranslateX;
  static VObject scalePivotTranslateY;
  static VObject scalePivotTranslateZ;
  static VObject rotateAxis;
  static VObject rotateAxisX;
  static VObject rotateAxisY;
  static VObject rotateAxisZ;
  static VObject transMinusRotatePivot;
  static VObject transMinusRotatePivotX;
  static VObject transMinusRotatePivotY;
  static VObject transMinusRotatePivotZ;
  static VObject minTransLimit;
  static VObject minTransXLimit;
  static VObject minTransYLimit;
  static VObject minTransZLimit;
  static VObject maxTransLimit;
  static VObject maxTransXLimit;
  static VObject maxTransYLimit;
  static VObject maxTransZLimit;
  static VObject minTransLimitEnable;
  static VObject minTransXLimitEnable;
  static VObject minTransYLimitEnable;
  static VObject minTransZLimitEnable;
  static VObject maxTransLimitEnable;
  static VObject maxTransXLimitEnable;
  static VObject maxTransYLimitEnable;
  static VObject maxTransZLimitEnable;
  static VObject minRotLimit;
  static VObject minRotXLimit;
  static VObject minRotYLimit;
  static VObject minRotZLimit;
  static VObject maxRotLimit;
  static VObject maxRotXLimit;
  static VObject maxRotYLimit;
  static VObject maxRotZLimit;
  static VObject minRotLimitEnable;
  static VObject minRotXLimitEnable;
  static VObject minRotYLimitEnable;
  static VObject minRotZLimitEnable;
  static VObject maxRotLimitEnable;
  static VObject maxRotXLimitEnable;
  static VObject maxRotYLimitEnable;
  static VObject maxRotZLimitEnable;
  static VObject minScaleLimit;
  static VObject minScaleXLimit;
  static VObject minScaleYLimit;
  static VObject minScaleZLimit;
  static VObject maxScaleLimit;
  static VObject maxScaleXLimit;
  static VObject maxScaleYLimit;
  static VObject maxScaleZLimit;
  static VObject minScaleLimitEnable;
  static VObject minScaleXLimitEnable;
  static VObject minScaleYLimitEnable;
  static VObject minScaleZLimitEnable;
  static VObject maxScaleLimitEnable;
  static VObject maxScaleXLimitEnable;
  static VObject maxScaleYLimitEnable;
  static VObject maxScaleZLimitEnable;
  static VObject geometry;
  static VObject xformMatrix;
  static VObject selectHandle;
  static VObject selectHandleX;
  static VObject selectHandleY;
  static VObject selectHandleZ;
  static VObject inheritsTransform;
  static VObject displayHandle;
  static VObject displayScalePivot;
  static VObject displayRotatePivot;
  static VObject displayLocalAxis;
  static VObject dynamics;
  static VObject showManipDefault;
  static VObject specifiedManipLocation;
  static VObject rotateQuaternion;
  static VObject rotateQuaternionX;
  static VObject rotateQuaternionY;
  static VObject rotateQuaternionZ;
  static VObject rotateQuaternionW;
  static VObject rotationInterpolation;
  static VObject offsetParentMatrix;

  // The matrix the transform keeps, made by createTransformationMatrix();
  // the transform deletes it.
  mutable VPxTransformationMatrix *baseTransformationMatrix;

protected:
  // The value to set for a component, given the one asked for and the one it
  // has: the saved value for locked axes (none are locked by default), and
  // for the limits the value clamped to the enabled ones.
  virtual VVector applyTranslationLocks(const VVector &toTest, const VVector &savedT,
                                        VStatus *ReturnStatus = NULL);
  virtual VVector applyTranslationLimits(const VVector &unclampedT, VDataBlock &block,
                                         VStatus *ReturnStatus = NULL);
  virtual VEulerRotation applyRotationLocks(const VEulerRotation &toTest,
                                            const VEulerRotation &savedRotation,
                                            VStatus *ReturnStatus = NULL);
  virtual VEulerRotation applyRotationLimits(const VEulerRotation &unclampedR, VDataBlock &block,
                                             VStatus *ReturnStatus = NULL);
  virtual VVector applyScaleLocks(const VVector &toTest, const VVector &savedScale,
                                  VStatus *ReturnStatus = NULL);
  virtual VVector applyScaleLimits(const VVector &unclampedS, VDataBlock &block,
                                   VStatus *ReturnStatus = NULL);
  virtual VVector applyShearLocks(const VVector &toTest, const VVector &savedShear,
                                  VStatus *ReturnStatus = NULL);
  virtual VEulerRotation applyRotateOrientationLocks(const VEulerRotation &toTest,
                                                     const VEulerRotation &savedRotation,
                                                     VStatus *ReturnStatus = NULL);
  virtual VPoint applyScaleLocksPivot(const VPoint &toTest, const VPoint &savedPivot,
                                      VStatus *ReturnStatus = NULL);
  virtual VVector applyScaleLocksPivotTranslate(const VVector &toTest,
                                                const VVector &savedTranslate,
                                                VStatus *ReturnStatus = NULL);
  virtual VPoint applyRotatePivotLocks(const VPoint &toTest, const VPoint &savedPivot,
                                       VStatus *ReturnStatus = NULL);
  virtual VVector applyRotatePivotLocksTranslate(const VVector &toTest,
                                                 const VVector &savedTranslate,
                                                 VStatus *ReturnStatus = NULL);

  // Tell the host that a component changed outside compute, so that it
  // re-evaluates the matrix plugs.
  VStatus dirtyMatrix();
  VStatus dirtyTranslation(const VVector &translation);
  VStatus dirtyRotation(const VEulerRotation &rotation);
  VStatus dirtyScale(const VVector &scale);
  VStatus dirtyShear(const VVector &shear);
  VStatus dirtyRotateOrientation(const VEulerRotation &orientation);
  VStatus dirtyScalePivot(const VPoint &pivot);
  VStatus dirtyScalePivotTranslation(const VVector &translation);
  VStatus dirtyRotatePivot(const VPoint &pivot);
  VStatus dirtyRotatePivotTranslation(const VVector &translation);
  // The limits changed outside setLimit() and enableLimit(); the host
  // clamps the components again.
  VStatus dirtyLimits();

private:
  VVector clamp(const VVector &value, VFnTransform::LimitType firstLimit) const;
  double fLimits[18];
  bool fLimitEnabled[18];
};

OPENVORLA_NAMESPACE_CLOSE
