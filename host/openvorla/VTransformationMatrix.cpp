// VTransformationMatrix: transformations kept as components, composed and decomposed.
#include <openvorla/VTransformationMatrix.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

namespace {

VMatrix translationMatrix(const VVector &t) { return VMatrix().setTranslation(t); }

VMatrix scaleShearMatrix(const VVector &scale, const VVector &shear) {
  VMatrix m;
  m(0, 0) = scale.x;
  m(1, 0) = scale.y * shear.x;
  m(1, 1) = scale.y;
  m(2, 0) = scale.z * shear.y;
  m(2, 1) = scale.z * shear.z;
  m(2, 2) = scale.z;
  return m;
}

VVector row(const VMatrix &m, unsigned int r) { return VVector(m(r, 0), m(r, 1), m(r, 2)); }

// The rotation that takes a point about the pivot instead of the origin.
VMatrix aboutPivot(const VMatrix &linear, const VPoint &pivot) {
  VVector p = pivot.asVector();
  return translationMatrix(-p) * linear * translationMatrix(p);
}

}  // namespace

VTransformationMatrix::VTransformationMatrix() : fOrder(kXYZ), fScale(1.0, 1.0, 1.0) {}

VTransformationMatrix::VTransformationMatrix(const VMatrix &matrix) : VTransformationMatrix() {
  decompose(matrix);
}

VTransformationMatrix::VTransformationMatrix(const VTransformationMatrix &other) = default;
VTransformationMatrix::~VTransformationMatrix() = default;
VTransformationMatrix &VTransformationMatrix::operator=(const VTransformationMatrix &other) =
    default;

VMatrix VTransformationMatrix::asScaleMatrix() const {
  return aboutPivot(scaleShearMatrix(fScale, fShear), fScalePivot) *
         translationMatrix(fScalePivotTranslation);
}

VMatrix VTransformationMatrix::asRotateMatrix() const {
  return aboutPivot((fRotateOrientation * fRotation).asMatrix(), fRotatePivot) *
         translationMatrix(fRotatePivotTranslation);
}

VMatrix VTransformationMatrix::asMatrix() const {
  return asScaleMatrix() * asRotateMatrix() * translationMatrix(fTranslation);
}

VMatrix VTransformationMatrix::asMatrix(double percent) const {
  VTransformationMatrix part(*this);
  VQuaternion none;
  part.fTranslation = fTranslation * percent;
  part.fRotation = VQuaternion::slerp(none, fRotation, percent);
  part.fRotateOrientation = VQuaternion::slerp(none, fRotateOrientation, percent);
  part.fScale = VVector(1.0, 1.0, 1.0) + (fScale - VVector(1.0, 1.0, 1.0)) * percent;
  part.fShear = fShear * percent;
  part.fScalePivotTranslation = fScalePivotTranslation * percent;
  part.fRotatePivotTranslation = fRotatePivotTranslation * percent;
  return part.asMatrix();
}

VMatrix VTransformationMatrix::asMatrixInverse() const { return asMatrix().inverse(); }

// The linear part is scale * shear * orientation * rotation, a lower-triangular
// matrix times an orthonormal one: Gram-Schmidt on its rows, taken in order,
// separates the two. The translation is what remains once every other
// component is in place.
VStatus VTransformationMatrix::decompose(const VMatrix &matrix) {
  if (std::fabs(matrix.det3x3()) < 1.0e-12)
    return VStatus(VStatus::kInvalidParameter, "A singular matrix cannot be decomposed");

  VVector r0 = row(matrix, 0), r1 = row(matrix, 1), r2 = row(matrix, 2);
  VVector scale, shear;
  scale.x = r0.length();
  VVector a0 = r0 / scale.x;
  double d10 = r1 * a0;
  VVector a1 = r1 - a0 * d10;
  scale.y = a1.length();
  a1 = a1 / scale.y;
  shear.x = d10 / scale.y;
  double d20 = r2 * a0, d21 = r2 * a1;
  VVector a2 = r2 - a0 * d20 - a1 * d21;
  scale.z = a2.length();
  a2 = a2 / scale.z;
  shear.y = d20 / scale.z;
  shear.z = d21 / scale.z;
  if ((a0 ^ a1) * a2 < 0.0) {  // a reflection: carried by the z scale
    a2 = -a2;
    scale.z = -scale.z;
    shear.y = -shear.y;
    shear.z = -shear.z;
  }

  VMatrix rotationMatrix;
  for (unsigned int c = 0; c < 3; ++c) {
    rotationMatrix(0, c) = a0[c];
    rotationMatrix(1, c) = a1[c];
    rotationMatrix(2, c) = a2[c];
  }
  fScale = scale;
  fShear = shear;
  fRotation = fRotateOrientation.inverse() * VQuaternion(rotationMatrix);
  fTranslation = VVector();
  fTranslation = matrix.translation() - asMatrix().translation();
  return VStatus::kSuccess;
}

VVector VTransformationMatrix::translation() const { return fTranslation; }
void VTransformationMatrix::setTranslation(const VVector &t) { fTranslation = t; }
VQuaternion VTransformationMatrix::rotation() const { return fRotation; }

void VTransformationMatrix::setRotation(const VQuaternion &rotation) {
  if (rotation.length() > 0.0) fRotation = rotation.normal();
}

VEulerRotation VTransformationMatrix::eulerRotation() const {
  return VEulerRotation::decompose(fRotation.asMatrix(), toEulerOrder(fOrder));
}

void VTransformationMatrix::setRotation(const VEulerRotation &rotation) {
  fRotation = rotation.asQuaternion();
}

VTransformationMatrix::RotationOrder VTransformationMatrix::rotationOrder() const { return fOrder; }

VStatus VTransformationMatrix::setRotationOrder(RotationOrder order, bool preserve) {
  if (order <= kInvalid || order >= kLast)
    return VStatus(VStatus::kInvalidParameter, "Invalid rotation order");
  if (!preserve) {
    VEulerRotation angles = eulerRotation();
    angles.order = toEulerOrder(order);
    fRotation = angles.asQuaternion();
  }
  fOrder = order;
  return VStatus::kSuccess;
}

VVector VTransformationMatrix::scale() const { return fScale; }
void VTransformationMatrix::setScale(const VVector &scale) { fScale = scale; }
VVector VTransformationMatrix::shear() const { return fShear; }
void VTransformationMatrix::setShear(const VVector &shear) { fShear = shear; }
VQuaternion VTransformationMatrix::rotateOrientation() const { return fRotateOrientation; }

void VTransformationMatrix::setRotateOrientation(const VQuaternion &orientation, bool balance) {
  if (orientation.length() == 0.0) return;
  VQuaternion unit = orientation.normal();
  if (balance) fRotation = unit.inverse() * fRotateOrientation * fRotation;
  fRotateOrientation = unit;
}

VPoint VTransformationMatrix::scalePivot() const { return fScalePivot; }

// Everything after the scale pivot translation is linear apart from pure
// translations, so a change of d there moves the result by d * (RO * R).
void VTransformationMatrix::setScalePivot(const VPoint &pivot, bool balance) {
  VVector before = asMatrix().translation();
  fScalePivot = pivot;
  if (!balance) return;
  VVector drift = before - asMatrix().translation();
  fScalePivotTranslation += drift * (fRotateOrientation * fRotation).inverse().asMatrix();
}

VPoint VTransformationMatrix::rotatePivot() const { return fRotatePivot; }

void VTransformationMatrix::setRotatePivot(const VPoint &pivot, bool balance) {
  VVector before = asMatrix().translation();
  fRotatePivot = pivot;
  if (balance) fRotatePivotTranslation += before - asMatrix().translation();
}

VVector VTransformationMatrix::scalePivotTranslation() const { return fScalePivotTranslation; }
void VTransformationMatrix::setScalePivotTranslation(const VVector &t) {
  fScalePivotTranslation = t;
}
VVector VTransformationMatrix::rotatePivotTranslation() const { return fRotatePivotTranslation; }
void VTransformationMatrix::setRotatePivotTranslation(const VVector &t) {
  fRotatePivotTranslation = t;
}

bool VTransformationMatrix::isEquivalent(const VTransformationMatrix &other,
                                         double tolerance) const {
  return asMatrix().isEquivalent(other.asMatrix(), tolerance);
}

bool VTransformationMatrix::operator==(const VTransformationMatrix &o) const {
  return fTranslation == o.fTranslation && fRotation == o.fRotation && fOrder == o.fOrder &&
         fScale == o.fScale && fShear == o.fShear && fRotateOrientation == o.fRotateOrientation &&
         fScalePivot == o.fScalePivot && fRotatePivot == o.fRotatePivot &&
         fScalePivotTranslation == o.fScalePivotTranslation &&
         fRotatePivotTranslation == o.fRotatePivotTranslation;
}

bool VTransformationMatrix::operator!=(const VTransformationMatrix &o) const {
  return !(*this == o);
}

// The two enumerations list the orders alike; this one starts with kInvalid.
VEulerRotation::RotationOrder VTransformationMatrix::toEulerOrder(RotationOrder order) {
  if (order <= kInvalid || order >= kLast) return VEulerRotation::kXYZ;
  return static_cast<VEulerRotation::RotationOrder>(order - kXYZ);
}

VTransformationMatrix::RotationOrder VTransformationMatrix::fromEulerOrder(
    VEulerRotation::RotationOrder order) {
  if (order < VEulerRotation::kXYZ || order > VEulerRotation::kZYX) return kInvalid;
  return static_cast<RotationOrder>(order + kXYZ);
}

OPENVORLA_NAMESPACE_CLOSE
