// Base class of the transformation matrices of plug-in transforms.
//
// The host's implementation keeps the components of a VTransformationMatrix
// and composes them as it does. A matrix on its own has no parent, so its
// world space is its transform space: the getters give the components in any
// valid space. The setters refuse kInvalid and values from kLast on with
// kInvalidParameter. Relative changes (translateBy, rotateBy) in
// kPostTransform are along the object's own rotated axes, in the other spaces
// along the parent's.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VEulerRotation.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VPoint.h>
#include <openvorla/VQuaternion.h>
#include <openvorla/VSpace.h>
#include <openvorla/VStatus.h>
#include <openvorla/VTransformationMatrix.h>
#include <openvorla/VTypeId.h>
#include <openvorla/VVector.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxTransformationMatrix {
public:
  VPxTransformationMatrix();
  VPxTransformationMatrix(const VPxTransformationMatrix &other);
  virtual ~VPxTransformationMatrix();
  VPxTransformationMatrix &operator=(const VPxTransformationMatrix &other);

  // The composed matrix; with percent, the part of the way from the identity.
  virtual VMatrix asMatrix() const;
  virtual VMatrix asMatrix(double percent) const;
  virtual VMatrix asMatrixInverse() const;
  virtual VMatrix asScaleMatrix() const;
  virtual VMatrix asScaleMatrixInverse() const;
  virtual VMatrix asRotateMatrix() const;
  virtual VMatrix asRotateMatrixInverse() const;
  // The translation alone, and the shear alone about the scale pivot.
  virtual VMatrix asTranslateMatrix() const;
  virtual VMatrix asTranslateMatrixInverse() const;
  virtual VMatrix asShearMatrix() const;
  virtual VTransformationMatrix asTransformationMatrix() const;
  // The composed matrices agree within tolerance (1.0e-10 without one).
  virtual bool isEquivalent(const VPxTransformationMatrix &other) const;
  virtual bool isEquivalent(const VPxTransformationMatrix &other, double tolerance) const;

  virtual VVector getTranslation(VSpace::Space space = VSpace::kTransform) const;
  virtual VVector getScale(VSpace::Space space = VSpace::kTransform) const;
  virtual VVector getShear(VSpace::Space space = VSpace::kTransform) const;
  virtual VQuaternion getRotation(VSpace::Space space = VSpace::kTransform) const;
  // The rotation as angles in the rotation order.
  virtual VEulerRotation getEulerRotation(VSpace::Space space = VSpace::kTransform) const;
  virtual VTransformationMatrix::RotationOrder getRotationOrder() const;
  virtual VQuaternion getRotateOrientation(VSpace::Space space = VSpace::kTransform) const;
  virtual VPoint getScalePivot(VSpace::Space space = VSpace::kTransform) const;
  virtual VPoint getRotatePivot(VSpace::Space space = VSpace::kTransform) const;
  virtual VVector getScalePivotTranslation(VSpace::Space space = VSpace::kTransform) const;
  virtual VVector getRotatePivotTranslation(VSpace::Space space = VSpace::kTransform) const;

  virtual VStatus translateTo(const VVector &vector, VSpace::Space space = VSpace::kTransform);
  virtual VStatus translateBy(const VVector &vector, VSpace::Space space = VSpace::kTransform);
  // The zero quaternion is no rotation and is refused with kInvalidParameter.
  virtual VStatus rotateTo(const VQuaternion &q, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateTo(const VEulerRotation &e, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateBy(const VQuaternion &q, VSpace::Space space = VSpace::kTransform);
  virtual VStatus rotateBy(const VEulerRotation &e, VSpace::Space space = VSpace::kTransform);
  // scaleBy multiplies the scale; shearBy adds to the shear, whose rest value is 0.
  virtual VStatus scaleTo(const VVector &scale, VSpace::Space space = VSpace::kTransform);
  virtual VStatus scaleBy(const VVector &scale, VSpace::Space space = VSpace::kTransform);
  virtual VStatus shearTo(const VVector &shear, VSpace::Space space = VSpace::kTransform);
  virtual VStatus shearBy(const VVector &shear, VSpace::Space space = VSpace::kTransform);
  // Without preserve the rotation is kept (preserve true).
  virtual VStatus setRotationOrder(VTransformationMatrix::RotationOrder order);
  virtual VStatus setRotationOrder(VTransformationMatrix::RotationOrder order, bool preserve);
  // balance: the other components change so that the composed matrix does not.
  virtual VStatus setRotateOrientation(const VQuaternion &q,
                                       VSpace::Space space = VSpace::kTransform,
                                       bool balance = true);
  virtual VStatus setRotateOrientation(const VEulerRotation &euler,
                                       VSpace::Space space = VSpace::kTransform,
                                       bool balance = true);
  virtual VStatus setScalePivot(const VPoint &pivot, VSpace::Space space = VSpace::kTransform,
                                bool balance = true);
  virtual VStatus setRotatePivot(const VPoint &pivot, VSpace::Space space = VSpace::kTransform,
                                 bool balance = true);
  virtual VStatus setScalePivotTranslation(const VVector &vector,
                                           VSpace::Space space = VSpace::kTransform);
  virtual VStatus setRotatePivotTranslation(const VVector &vector,
                                            VSpace::Space space = VSpace::kTransform);

  // Back to the identity, or to the components of a matrix (no pivots), or to
  // given components. The rotation order stays, except with given components.
  virtual VStatus resetTransformation();
  virtual VStatus resetTransformation(const VMatrix &matrix);
  virtual VStatus resetTransformation(const VTransformationMatrix &matrix);
  // Applies the matrix after the transformation (before it in kPostTransform)
  // and decomposes the result, keeping the pivots and the rotate orientation.
  virtual VStatus transformUsing(const VMatrix &matrix);
  virtual VStatus transformUsing(const VMatrix &matrix, VSpace::Space space);
  // The translation, rotation, scale and shear that compose to the matrix with
  // the pivots and rotate orientation kept; kInvalidParameter when singular.
  virtual VStatus decomposeMatrix(const VMatrix &matrix);
  // Takes the components of another matrix; kInvalidParameter for null.
  virtual VStatus copyValues(VPxTransformationMatrix *other);

  static void *creator();  // a new VPxTransformationMatrix

  static const VPxTransformationMatrix identity;
  static VTypeId baseTransformationMatrixId;

protected:
  // The stored components, for derived matrices to compose their own. The
  // pivot translations, which balance the pivots, are the getters'.
  VVector translation() const;
  VQuaternion rotation() const;
  VVector scale() const;
  VVector shear() const;
  VQuaternion rotateOrientation() const;
  VPoint rotatePivot() const;
  VPoint scalePivot() const;
  VTransformationMatrix::RotationOrder rotationOrder() const;

private:
  VTransformationMatrix fValues;
};

OPENVORLA_NAMESPACE_CLOSE
