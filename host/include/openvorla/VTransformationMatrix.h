// A transformation kept as its components. Composed for row vectors as
//
//   SP^-1 * S * SH * SP * SPT * RP^-1 * RO * R * RP * RPT * T
//
// SP scale pivot, S scale, SH shear, SPT scale pivot translation, RP rotate
// pivot, RO rotate orientation, R rotation, RPT rotate pivot translation and
// T translation, the leftmost applied first. The shear (xy, xz, yz) adds xy
// times y to x, xz times z to x and yz times z to y.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VEulerRotation.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VPoint.h>
#include <openvorla/VQuaternion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VTransformationMatrix {
public:
  enum RotationOrder {
    kInvalid,
    kXYZ,
    kYZX,
    kZXY,
    kXZY,
    kYXZ,
    kZYX,
    kLast
  };

  VTransformationMatrix();  // the identity, rotation order kXYZ
  // The components of the matrix, with no pivots and no rotate orientation;
  // a singular matrix gives the identity components.
  explicit VTransformationMatrix(const VMatrix &matrix);
  VTransformationMatrix(const VTransformationMatrix &other);
  ~VTransformationMatrix();
  VTransformationMatrix &operator=(const VTransformationMatrix &other);

  VMatrix asMatrix() const;
  // The transformation part of the way from the identity: translation, shear
  // and rotations scaled by percent, scale from 1 towards its value.
  VMatrix asMatrix(double percent) const;
  VMatrix asMatrixInverse() const;
  VMatrix asScaleMatrix() const;   // SP^-1 * S * SH * SP * SPT
  VMatrix asRotateMatrix() const;  // RP^-1 * RO * R * RP * RPT

  // Sets the translation, rotation, scale and shear so that asMatrix() equals
  // the matrix, keeping the pivots, their translations and the rotate
  // orientation. kInvalidParameter for a singular matrix, which changes nothing.
  VStatus decompose(const VMatrix &matrix);

  VVector translation() const;
  void setTranslation(const VVector &translation);
  VQuaternion rotation() const;
  void setRotation(const VQuaternion &rotation);  // normalised; the zero quaternion is refused
  VEulerRotation eulerRotation() const;           // in rotationOrder()
  void setRotation(const VEulerRotation &rotation);
  RotationOrder rotationOrder() const;
  // preserve: the rotation stays and its angles change; otherwise the angles
  // stay and are read in the new order. kInvalidParameter for kInvalid, kLast.
  VStatus setRotationOrder(RotationOrder order, bool preserve = true);
  VVector scale() const;
  void setScale(const VVector &scale);
  VVector shear() const;
  void setShear(const VVector &shear);
  VQuaternion rotateOrientation() const;
  // balance: the rotation changes so that the composed matrix does not.
  void setRotateOrientation(const VQuaternion &orientation, bool balance = true);
  VPoint scalePivot() const;
  // balance: the pivot translation changes so that the composed matrix does not.
  void setScalePivot(const VPoint &pivot, bool balance = true);
  VPoint rotatePivot() const;
  void setRotatePivot(const VPoint &pivot, bool balance = true);
  VVector scalePivotTranslation() const;
  void setScalePivotTranslation(const VVector &translation);
  VVector rotatePivotTranslation() const;
  void setRotatePivotTranslation(const VVector &translation);

  // The composed matrices are equivalent.
  bool isEquivalent(const VTransformationMatrix &other, double tolerance = 1.0e-10) const;
  // Every component is equal.
  bool operator==(const VTransformationMatrix &other) const;
  bool operator!=(const VTransformationMatrix &other) const;

  static VEulerRotation::RotationOrder toEulerOrder(RotationOrder order);
  static RotationOrder fromEulerOrder(VEulerRotation::RotationOrder order);

private:
  VVector fTranslation;
  VQuaternion fRotation;
  RotationOrder fOrder;
  VVector fScale;
  VVector fShear;
  VQuaternion fRotateOrientation;
  VPoint fScalePivot;
  VPoint fRotatePivot;
  VVector fScalePivotTranslation;
  VVector fRotatePivotTranslation;
};

OPENVORLA_NAMESPACE_CLOSE
