// VPxTransformationMatrix: the host's transformation matrix, kept as components.
#include <openvorla/VPxTransformationMatrix.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

bool validSpace(VSpace::Space space) { return space > VSpace::kInvalid && space < VSpace::kLast; }

VStatus invalidSpace() { return VStatus(VStatus::kInvalidParameter, "Invalid space"); }

VStatus zeroRotation() {
  return VStatus(VStatus::kInvalidParameter, "A zero quaternion is not a rotation");
}

}  // namespace

VPxTransformationMatrix::VPxTransformationMatrix() {
  standin::noteConstructed("VPxTransformationMatrix");
}

VPxTransformationMatrix::VPxTransformationMatrix(const VPxTransformationMatrix &other)
    : fValues(other.fValues) {
  standin::noteConstructed("VPxTransformationMatrix");
}

VPxTransformationMatrix::~VPxTransformationMatrix() {
  standin::noteDestroyed("VPxTransformationMatrix");
}

VPxTransformationMatrix &VPxTransformationMatrix::operator=(const VPxTransformationMatrix &other) {
  fValues = other.fValues;
  return *this;
}

VMatrix VPxTransformationMatrix::asMatrix() const { return fValues.asMatrix(); }
VMatrix VPxTransformationMatrix::asMatrix(double percent) const {
  return fValues.asMatrix(percent);
}
VMatrix VPxTransformationMatrix::asMatrixInverse() const { return fValues.asMatrixInverse(); }
VMatrix VPxTransformationMatrix::asScaleMatrix() const { return fValues.asScaleMatrix(); }
VMatrix VPxTransformationMatrix::asScaleMatrixInverse() const {
  return fValues.asScaleMatrix().inverse();
}
VMatrix VPxTransformationMatrix::asRotateMatrix() const { return fValues.asRotateMatrix(); }
VMatrix VPxTransformationMatrix::asRotateMatrixInverse() const {
  return fValues.asRotateMatrix().inverse();
}

VMatrix VPxTransformationMatrix::asTranslateMatrix() const {
  VTransformationMatrix translate;
  translate.setTranslation(fValues.translation());
  return translate.asMatrix();
}

VMatrix VPxTransformationMatrix::asTranslateMatrixInverse() const {
  return asTranslateMatrix().inverse();
}

VMatrix VPxTransformationMatrix::asShearMatrix() const {
  VTransformationMatrix shear;
  shear.setShear(fValues.shear());
  shear.setScalePivot(fValues.scalePivot(), false);
  return shear.asScaleMatrix();
}

VTransformationMatrix VPxTransformationMatrix::asTransformationMatrix() const { return fValues; }

bool VPxTransformationMatrix::isEquivalent(const VPxTransformationMatrix &other) const {
  return isEquivalent(other, 1.0e-10);
}

bool VPxTransformationMatrix::isEquivalent(const VPxTransformationMatrix &other,
                                           double tolerance) const {
  return fValues.isEquivalent(other.fValues, tolerance);
}

VVector VPxTransformationMatrix::getTranslation(VSpace::Space) const {
  return fValues.translation();
}
VVector VPxTransformationMatrix::getScale(VSpace::Space) const { return fValues.scale(); }
VVector VPxTransformationMatrix::getShear(VSpace::Space) const { return fValues.shear(); }
VQuaternion VPxTransformationMatrix::getRotation(VSpace::Space) const { return fValues.rotation(); }

VEulerRotation VPxTransformationMatrix::getEulerRotation(VSpace::Space) const {
  return fValues.eulerRotation();
}

VTransformationMatrix::RotationOrder VPxTransformationMatrix::getRotationOrder() const {
  return fValues.rotationOrder();
}

VQuaternion VPxTransformationMatrix::getRotateOrientation(VSpace::Space) const {
  return fValues.rotateOrientation();
}

VPoint VPxTransformationMatrix::getScalePivot(VSpace::Space) const { return fValues.scalePivot(); }
VPoint VPxTransformationMatrix::getRotatePivot(VSpace::Space) const {
  return fValues.rotatePivot();
}

VVector VPxTransformationMatrix::getScalePivotTranslation(VSpace::Space) const {
  return fValues.scalePivotTranslation();
}

VVector VPxTransformationMatrix::getRotatePivotTranslation(VSpace::Space) const {
  return fValues.rotatePivotTranslation();
}

VStatus VPxTransformationMatrix::translateTo(const VVector &vector, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setTranslation(vector);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::translateBy(const VVector &vector, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  VVector offset = vector;
  if (space == VSpace::kPostTransform)
    offset = vector * (fValues.rotateOrientation() * fValues.rotation()).asMatrix();
  fValues.setTranslation(fValues.translation() + offset);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::rotateTo(const VQuaternion &q, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  if (q.length() == 0.0) return zeroRotation();
  fValues.setRotation(q);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::rotateTo(const VEulerRotation &e, VSpace::Space space) {
  return rotateTo(e.asQuaternion(), space);
}

VStatus VPxTransformationMatrix::rotateBy(const VQuaternion &q, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  if (q.length() == 0.0) return zeroRotation();
  VQuaternion unit = q.normal(), current = fValues.rotation();
  fValues.setRotation(space == VSpace::kPostTransform ? unit * current : current * unit);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::rotateBy(const VEulerRotation &e, VSpace::Space space) {
  return rotateBy(e.asQuaternion(), space);
}

VStatus VPxTransformationMatrix::scaleTo(const VVector &scale, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setScale(scale);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::scaleBy(const VVector &scale, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  VVector s = fValues.scale();
  fValues.setScale(VVector(s.x * scale.x, s.y * scale.y, s.z * scale.z));
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::shearTo(const VVector &shear, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setShear(shear);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::shearBy(const VVector &shear, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setShear(fValues.shear() + shear);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::setRotationOrder(VTransformationMatrix::RotationOrder order) {
  return setRotationOrder(order, true);
}

VStatus VPxTransformationMatrix::setRotationOrder(VTransformationMatrix::RotationOrder order,
                                                  bool preserve) {
  return fValues.setRotationOrder(order, preserve);
}

VStatus VPxTransformationMatrix::setRotateOrientation(const VQuaternion &q, VSpace::Space space,
                                                      bool balance) {
  if (!validSpace(space)) return invalidSpace();
  if (q.length() == 0.0) return zeroRotation();
  fValues.setRotateOrientation(q, balance);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::setRotateOrientation(const VEulerRotation &euler,
                                                      VSpace::Space space, bool balance) {
  return setRotateOrientation(euler.asQuaternion(), space, balance);
}

VStatus VPxTransformationMatrix::setScalePivot(const VPoint &pivot, VSpace::Space space,
                                               bool balance) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setScalePivot(pivot, balance);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::setRotatePivot(const VPoint &pivot, VSpace::Space space,
                                                bool balance) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setRotatePivot(pivot, balance);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::setScalePivotTranslation(const VVector &vector,
                                                          VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setScalePivotTranslation(vector);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::setRotatePivotTranslation(const VVector &vector,
                                                           VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  fValues.setRotatePivotTranslation(vector);
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::resetTransformation() {
  VTransformationMatrix reset;
  reset.setRotationOrder(fValues.rotationOrder());
  fValues = reset;
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::resetTransformation(const VMatrix &matrix) {
  VTransformationMatrix reset;
  reset.setRotationOrder(fValues.rotationOrder());
  VStatus status = reset.decompose(matrix);
  if (status) fValues = reset;
  return status;
}

VStatus VPxTransformationMatrix::resetTransformation(const VTransformationMatrix &matrix) {
  fValues = matrix;
  return VStatus::kSuccess;
}

VStatus VPxTransformationMatrix::transformUsing(const VMatrix &matrix) {
  return transformUsing(matrix, VSpace::kTransform);
}

VStatus VPxTransformationMatrix::transformUsing(const VMatrix &matrix, VSpace::Space space) {
  if (!validSpace(space)) return invalidSpace();
  VMatrix current = fValues.asMatrix();
  return fValues.decompose(space == VSpace::kPostTransform ? matrix * current : current * matrix);
}

VStatus VPxTransformationMatrix::decomposeMatrix(const VMatrix &matrix) {
  return fValues.decompose(matrix);
}

VStatus VPxTransformationMatrix::copyValues(VPxTransformationMatrix *other) {
  if (!other) return VStatus(VStatus::kInvalidParameter, "No matrix to copy from");
  fValues = other->fValues;
  return VStatus::kSuccess;
}

VVector VPxTransformationMatrix::translation() const { return fValues.translation(); }
VQuaternion VPxTransformationMatrix::rotation() const { return fValues.rotation(); }
VVector VPxTransformationMatrix::scale() const { return fValues.scale(); }
VVector VPxTransformationMatrix::shear() const { return fValues.shear(); }
VQuaternion VPxTransformationMatrix::rotateOrientation() const {
  return fValues.rotateOrientation();
}
VPoint VPxTransformationMatrix::rotatePivot() const { return fValues.rotatePivot(); }
VPoint VPxTransformationMatrix::scalePivot() const { return fValues.scalePivot(); }

VTransformationMatrix::RotationOrder VPxTransformationMatrix::rotationOrder() const {
  return fValues.rotationOrder();
}

void *VPxTransformationMatrix::creator() { return new VPxTransformationMatrix(); }

const VPxTransformationMatrix VPxTransformationMatrix::identity;
VTypeId VPxTransformationMatrix::baseTransformationMatrixId(0x70000);

OPENVORLA_NAMESPACE_CLOSE
