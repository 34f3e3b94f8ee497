// VPxTransform: the host's default transform behaviour, the limits of the
// components, and the static attribute objects.
#include <openvorla/VPxTransform.h>


#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include <algorithm>
#include <atomic>
#include <cmath>

#include "BaseAttributes.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

constexpr int kLimitCount = VFnTransform::kTranslateMaxZ + 1;

std::atomic<bool> gNonAffineMatrices{true};

bool validLimit(VFnTransform::LimitType type) {
  return type >= VFnTransform::kScaleMinX && type <= VFnTransform::kTranslateMaxZ;
}

bool isMinimum(VFnTransform::LimitType type) { return (type - VFnTransform::kScaleMinX) % 2 == 0; }

VStatus badLimit() { return VStatus(VStatus::kInvalidParameter, "Not a limit type"); }

template <typename T>
T succeed(VStatus *ReturnStatus, T value) {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return value;
}

}  // namespace

VPxTransform::VPxTransform() : baseTransformationMatrix(nullptr) {
  resetLimits();
  standin::noteConstructed("VPxTransform");
}

VPxTransform::~VPxTransform() {
  delete baseTransformationMatrix;
  standin::noteDestroyed("VPxTransform");
}

VPxNode::Type VPxTransform::type() const { return kTransformNode; }

VPxTransformationMatrix *VPxTransform::createTransformationMatrix() {
  return new VPxTransformationMatrix();
}

VPxTransformationMatrix &VPxTransform::transformationMatrix() const {
  if (!baseTransformationMatrix) {
    baseTransformationMatrix = const_cast<VPxTransform *>(this)->createTransformationMatrix();
    if (!baseTransformationMatrix) baseTransformationMatrix = new VPxTransformationMatrix();
  }
  return *baseTransformationMatrix;
}

bool VPxTransform::isBounded() const { return false; }
VBoundingBox VPxTransform::boundingBox() const { return VBoundingBox(); }
bool VPxTransform::treatAsTransform() const { return true; }

void VPxTransform::resetTransformation(VDataBlock &) {
  transformationMatrix().resetTransformation();
}

void VPxTransform::resetTransformation(const VMatrix &matrix) {
  transformationMatrix().resetTransformation(matrix);
}

VStatus VPxTransform::computeLocalTransformation(VPxTransformationMatrix *xform, VDataBlock &) {
  if (!xform) return VStatus(VStatus::kInvalidParameter, "No matrix to compute into");
  VPxTransformationMatrix &own = transformationMatrix();
  return xform == &own ? VStatus(VStatus::kSuccess) : xform->copyValues(&own);
}

VStatus VPxTransform::validateAndSetValue(const VPlug &, const VDataHandle &) {
  return VStatus::kUnknownParameter;
}

VStatus VPxTransform::validateAndSetValue(const VPlug &plug, const VDataHandle &handle,
                                          const VDGContext &) {
  return validateAndSetValue(plug, handle);
}

VStatus VPxTransform::updateMatrixAttrs(const VDGContext &) { return VStatus::kSuccess; }
VStatus VPxTransform::updateMatrixAttrs(VObject &, const VDGContext &) { return VStatus::kSuccess; }

void VPxTransform::copyInternalData(VPxNode *node) {
  VPxNode::copyInternalData(node);
  auto *original = dynamic_cast<VPxTransform *>(node);
  if (!original || original == this) return;
  transformationMatrix().copyValues(&original->transformationMatrix());
  copyLimits(*original);
}

VMatrix VPxTransform::getMatrix(VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().asMatrix());
}

VMatrix VPxTransform::getMatrix(const VDGContext &, VStatus *ReturnStatus) {
  return getMatrix(ReturnStatus);
}

VMatrix VPxTransform::getMatrixInverse(VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().asMatrixInverse());
}

VMatrix VPxTransform::getMatrixInverse(const VDGContext &, VStatus *ReturnStatus) {
  return getMatrixInverse(ReturnStatus);
}

VVector VPxTransform::getTranslation(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getTranslation(space));
}

VVector VPxTransform::getTranslation(VSpace::Space space, const VDGContext &,
                                     VStatus *ReturnStatus) {
  return getTranslation(space, ReturnStatus);
}

VStatus VPxTransform::translateTo(const VVector &vector, VSpace::Space space) {
  return transformationMatrix().translateTo(vector, space);
}

VStatus VPxTransform::translateTo(const VVector &vector, VSpace::Space space, const VDGContext &) {
  return translateTo(vector, space);
}

VStatus VPxTransform::translateBy(const VVector &vector, VSpace::Space space) {
  return transformationMatrix().translateBy(vector, space);
}

VStatus VPxTransform::translateBy(const VVector &vector, VSpace::Space space, const VDGContext &) {
  return translateBy(vector, space);
}

VQuaternion VPxTransform::getRotation(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getRotation(space));
}

VQuaternion VPxTransform::getRotation(VSpace::Space space, const VDGContext &,
                                      VStatus *ReturnStatus) {
  return getRotation(space, ReturnStatus);
}

VEulerRotation VPxTransform::getEulerRotation(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getEulerRotation(space));
}

VEulerRotation VPxTransform::getEulerRotation(VSpace::Space space, const VDGContext &,
                                              VStatus *ReturnStatus) {
  return getEulerRotation(space, ReturnStatus);
}

VStatus VPxTransform::rotateTo(const VQuaternion &q, VSpace::Space space) {
  return transformationMatrix().rotateTo(q, space);
}

VStatus VPxTransform::rotateTo(const VQuaternion &q, VSpace::Space space, const VDGContext &) {
  return rotateTo(q, space);
}

VStatus VPxTransform::rotateTo(const VEulerRotation &e, VSpace::Space space) {
  return transformationMatrix().rotateTo(e, space);
}

VStatus VPxTransform::rotateTo(const VEulerRotation &e, VSpace::Space space, const VDGContext &) {
  return rotateTo(e, space);
}

VStatus VPxTransform::rotateBy(const VQuaternion &q, VSpace::Space space) {
  return transformationMatrix().rotateBy(q, space);
}

VStatus VPxTransform::rotateBy(const VQuaternion &q, VSpace::Space space, const VDGContext &) {
  return rotateBy(q, space);
}

VStatus VPxTransform::rotateBy(const VEulerRotation &e, VSpace::Space space) {
  return transformationMatrix().rotateBy(e, space);
}

VStatus VPxTransform::rotateBy(const VEulerRotation &e, VSpace::Space space, const VDGContext &) {
  return rotateBy(e, space);
}

VTransformationMatrix::RotationOrder VPxTransform::getRotationOrder() {
  return transformationMatrix().getRotationOrder();
}

VTransformationMatrix::RotationOrder VPxTransform::getRotationOrder(const VDGContext &) {
  return getRotationOrder();
}

VStatus VPxTransform::setRotationOrder(VTransformationMatrix::RotationOrder order, bool reorder) {
  return transformationMatrix().setRotationOrder(order, reorder);
}

VStatus VPxTransform::setRotationOrder(VTransformationMatrix::RotationOrder order, bool reorder,
                                       const VDGContext &) {
  return setRotationOrder(order, reorder);
}

VVector VPxTransform::getScale(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getScale(space));
}

VVector VPxTransform::getScale(VSpace::Space space, const VDGContext &, VStatus *ReturnStatus) {
  return getScale(space, ReturnStatus);
}

VStatus VPxTransform::scaleTo(const VVector &scale, VSpace::Space space) {
  return transformationMatrix().scaleTo(scale, space);
}

VStatus VPxTransform::scaleTo(const VVector &scale, VSpace::Space space, const VDGContext &) {
  return scaleTo(scale, space);
}

VStatus VPxTransform::scaleBy(const VVector &scale, VSpace::Space space) {
  return transformationMatrix().scaleBy(scale, space);
}

VStatus VPxTransform::scaleBy(const VVector &scale, VSpace::Space space, const VDGContext &) {
  return scaleBy(scale, space);
}

VVector VPxTransform::getShear(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getShear(space));
}

VVector VPxTransform::getShear(VSpace::Space space, const VDGContext &, VStatus *ReturnStatus) {
  return getShear(space, ReturnStatus);
}

VStatus VPxTransform::shearTo(const VVector &shear, VSpace::Space space) {
  return transformationMatrix().shearTo(shear, space);
}

VStatus VPxTransform::shearTo(const VVector &shear, VSpace::Space space, const VDGContext &) {
  return shearTo(shear, space);
}

VStatus VPxTransform::shearBy(const VVector &shear, VSpace::Space space) {
  return transformationMatrix().shearBy(shear, space);
}

VStatus VPxTransform::shearBy(const VVector &shear, VSpace::Space space, const VDGContext &) {
  return shearBy(shear, space);
}

VPoint VPxTransform::getScalePivot(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getScalePivot(space));
}

VPoint VPxTransform::getScalePivot(VSpace::Space space, const VDGContext &, VStatus *ReturnStatus) {
  return getScalePivot(space, ReturnStatus);
}

VStatus VPxTransform::setScalePivot(const VPoint &pivot, VSpace::Space space, bool balance) {
  return transformationMatrix().setScalePivot(pivot, space, balance);
}

VStatus VPxTransform::setScalePivot(const VPoint &pivot, VSpace::Space space, bool balance,
                                    const VDGContext &) {
  return setScalePivot(pivot, space, balance);
}

VVector VPxTransform::getScalePivotTranslation(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getScalePivotTranslation(space));
}

VVector VPxTransform::getScalePivotTranslation(VSpace::Space space, const VDGContext &,
                                               VStatus *ReturnStatus) {
  return getScalePivotTranslation(space, ReturnStatus);
}

VStatus VPxTransform::setScalePivotTranslation(const VVector &vector, VSpace::Space space) {
  return transformationMatrix().setScalePivotTranslation(vector, space);
}

VStatus VPxTransform::setScalePivotTranslation(const VVector &vector, VSpace::Space space,
                                               const VDGContext &) {
  return setScalePivotTranslation(vector, space);
}

VPoint VPxTransform::getRotatePivot(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getRotatePivot(space));
}

VPoint VPxTransform::getRotatePivot(VSpace::Space space, const VDGContext &,
                                    VStatus *ReturnStatus) {
  return getRotatePivot(space, ReturnStatus);
}

VStatus VPxTransform::setRotatePivot(const VPoint &pivot, VSpace::Space space, bool balance) {
  return transformationMatrix().setRotatePivot(pivot, space, balance);
}

VStatus VPxTransform::setRotatePivot(const VPoint &pivot, VSpace::Space space, bool balance,
                                     const VDGContext &) {
  return setRotatePivot(pivot, space, balance);
}

VVector VPxTransform::getRotatePivotTranslation(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getRotatePivotTranslation(space));
}

VVector VPxTransform::getRotatePivotTranslation(VSpace::Space space, const VDGContext &,
                                                VStatus *ReturnStatus) {
  return getRotatePivotTranslation(space, ReturnStatus);
}

VStatus VPxTransform::setRotatePivotTranslation(const VVector &vector, VSpace::Space space) {
  return transformationMatrix().setRotatePivotTranslation(vector, space);
}

VStatus VPxTransform::setRotatePivotTranslation(const VVector &vector, VSpace::Space space,
                                                const VDGContext &) {
  return setRotatePivotTranslation(vector, space);
}

VQuaternion VPxTransform::getRotateOrientation(VSpace::Space space, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, transformationMatrix().getRotateOrientation(space));
}

VQuaternion VPxTransform::getRotateOrientation(VSpace::Space space, const VDGContext &,
                                               VStatus *ReturnStatus) {
  return getRotateOrientation(space, ReturnStatus);
}

VStatus VPxTransform::setRotateOrientation(const VQuaternion &q, VSpace::Space space,
                                           bool balance) {
  return transformationMatrix().setRotateOrientation(q, space, balance);
}

VStatus VPxTransform::setRotateOrientation(const VQuaternion &q, VSpace::Space space, bool balance,
                                           const VDGContext &) {
  return setRotateOrientation(q, space, balance);
}

// Each checkAndSet* applies the locks to the value asked for, then the
// limits, and sets what is left; a failing lock or limit sets nothing.
VStatus VPxTransform::checkAndSetTranslation(VDataBlock &block, const VPlug &,
                                             const VVector &translation, VSpace::Space space) {
  VStatus status;
  VVector value = applyTranslationLocks(translation, getTranslation(space), &status);
  if (status) value = applyTranslationLimits(value, block, &status);
  return status ? translateTo(value, space) : status;
}

VStatus VPxTransform::checkAndSetRotation(VDataBlock &block, const VPlug &,
                                          const VEulerRotation &rotation, VSpace::Space space) {
  VStatus status;
  VEulerRotation value = applyRotationLocks(rotation, getEulerRotation(space), &status);
  if (status) value = applyRotationLimits(value, block, &status);
  return status ? rotateTo(value, space) : status;
}

VStatus VPxTransform::checkAndSetScale(VDataBlock &block, const VPlug &, const VVector &scale,
                                       VSpace::Space space) {
  VStatus status;
  VVector value = applyScaleLocks(scale, getScale(space), &status);
  if (status) value = applyScaleLimits(value, block, &status);
  return status ? scaleTo(value, space) : status;
}

VStatus VPxTransform::checkAndSetShear(VDataBlock &, const VPlug &, const VVector &shear,
                                       VSpace::Space space) {
  VStatus status;
  VVector value = applyShearLocks(shear, getShear(space), &status);
  return status ? shearTo(value, space) : status;
}

VStatus VPxTransform::checkAndSetRotateOrientation(VDataBlock &, const VPlug &,
                                                   const VEulerRotation &orientation,
                                                   VSpace::Space space, bool balance) {
  VStatus status;
  VEulerRotation saved =
      VEulerRotation::decompose(getRotateOrientation(space).asMatrix(), orientation.order);
  VEulerRotation value = applyRotateOrientationLocks(orientation, saved, &status);
  return status ? setRotateOrientation(value.asQuaternion(), space, balance) : status;
}

VStatus VPxTransform::checkAndSetRotatePivot(VDataBlock &, const VPlug &, const VPoint &pivot,
                                             VSpace::Space space, bool balance) {
  VStatus status;
  VPoint value = applyRotatePivotLocks(pivot, getRotatePivot(space), &status);
  return status ? setRotatePivot(value, space, balance) : status;
}

VStatus VPxTransform::checkAndSetRotatePivotTranslation(VDataBlock &, const VPlug &,
                                                        const VVector &translation,
                                                        VSpace::Space space) {
  VStatus status;
  VVector value =
      applyRotatePivotLocksTranslate(translation, getRotatePivotTranslation(space), &status);
  return status ? setRotatePivotTranslation(value, space) : status;
}

VStatus VPxTransform::checkAndSetScalePivot(VDataBlock &, const VPlug &, const VPoint &pivot,
                                            VSpace::Space space) {
  VStatus status;
  VPoint value = applyScaleLocksPivot(pivot, getScalePivot(space), &status);
  return status ? setScalePivot(value, space) : status;
}

VStatus VPxTransform::checkAndSetScalePivotTranslation(VDataBlock &, const VPlug &,
                                                       const VVector &translation,
                                                       VSpace::Space space) {
  VStatus status;
  VVector value =
      applyScaleLocksPivotTranslate(translation, getScalePivotTranslation(space), &status);
  return status ? setScalePivotTranslation(value, space) : status;
}

VPxTransformationMatrix *VPxTransform::transformationMatrixPtr() const {
  return &transformationMatrix();
}

bool VPxTransform::hasTransformationMatrix() const { return baseTransformationMatrix != nullptr; }

bool VPxTransform::isLimited(VFnTransform::LimitType type, VStatus *ReturnStatus) const {
  if (!validLimit(type)) {
    if (ReturnStatus) *ReturnStatus = badLimit();
    return false;
  }
  return succeed(ReturnStatus, fLimitEnabled[type]);
}

double VPxTransform::limitValue(VFnTransform::LimitType type, VStatus *ReturnStatus) const {
  if (!validLimit(type)) {
    if (ReturnStatus) *ReturnStatus = badLimit();
    return 0.0;
  }
  return succeed(ReturnStatus, fLimits[type]);
}

VStatus VPxTransform::setLimit(VFnTransform::LimitType type, double value) {
  if (!validLimit(type)) return badLimit();
  int other = isMinimum(type) ? type + 1 : type - 1;
  if (isMinimum(type) ? value > fLimits[other] : value < fLimits[other])
    return VStatus(VStatus::kInvalidParameter, "The limit passes the other limit of its axis");
  fLimits[type] = value;
  return VStatus::kSuccess;
}

VStatus VPxTransform::enableLimit(VFnTransform::LimitType type, bool flag) {
  if (!validLimit(type)) return badLimit();
  fLimitEnabled[type] = flag;
  return VStatus::kSuccess;
}

VStatus VPxTransform::clearLimits() {
  std::fill(fLimitEnabled, fLimitEnabled + kLimitCount, false);
  return VStatus::kSuccess;
}

VStatus VPxTransform::resetLimits() {
  for (int i = 0; i < kLimitCount; ++i) {
    auto type = static_cast<VFnTransform::LimitType>(i);
    double bound =
        type >= VFnTransform::kRotateMinX && type <= VFnTransform::kRotateMaxZ ? 2 * M_PI : 1.0;
    fLimits[i] = isMinimum(type) ? -bound : bound;
  }
  return clearLimits();
}

VStatus VPxTransform::copyLimits(const VPxTransform &other) {
  std::copy(other.fLimits, other.fLimits + kLimitCount, fLimits);
  std::copy(other.fLimitEnabled, other.fLimitEnabled + kLimitCount, fLimitEnabled);
  return VStatus::kSuccess;
}

void VPxTransform::mustCallValidateAndSet(VObject &) {}

VStatus VPxTransform::setNonAffineMatricesEnabled(bool enabled) {
  gNonAffineMatrices.store(enabled);
  return VStatus::kSuccess;
}

bool VPxTransform::isNonAffineMatricesEnabled(VStatus *ReturnStatus) {
  return succeed(ReturnStatus, gNonAffineMatrices.load());
}

const char *VPxTransform::className() { return "VPxTransform"; }

VVector VPxTransform::clamp(const VVector &value, VFnTransform::LimitType firstLimit) const {
  VVector result = value;
  for (int axis = 0; axis < 3; ++axis) {
    int low = firstLimit + 2 * axis, high = low + 1;
    if (fLimitEnabled[low]) result[axis] = std::max(result[axis], fLimits[low]);
    if (fLimitEnabled[high]) result[axis] = std::min(result[axis], fLimits[high]);
  }
  return result;
}

VVector VPxTransform::applyTranslationLocks(const VVector &toTest, const VVector &,
                                            VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VVector VPxTransform::applyTranslationLimits(const VVector &unclampedT, VDataBlock &,
                                             VStatus *ReturnStatus) {
  return succeed(ReturnStatus, clamp(unclampedT, VFnTransform::kTranslateMinX));
}

VEulerRotation VPxTransform::applyRotationLocks(const VEulerRotation &toTest,
                                                const VEulerRotation &, VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VEulerRotation VPxTransform::applyRotationLimits(const VEulerRotation &unclampedR, VDataBlock &,
                                                 VStatus *ReturnStatus) {
  return succeed(
      ReturnStatus,
      VEulerRotation(clamp(unclampedR.asVector(), VFnTransform::kRotateMinX), unclampedR.order));
}

VVector VPxTransform::applyScaleLocks(const VVector &toTest, const VVector &,
                                      VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VVector VPxTransform::applyScaleLimits(const VVector &unclampedS, VDataBlock &,
                                       VStatus *ReturnStatus) {
  return succeed(ReturnStatus, clamp(unclampedS, VFnTransform::kScaleMinX));
}

VVector VPxTransform::applyShearLocks(const VVector &toTest, const VVector &,
                                      VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VEulerRotation VPxTransform::applyRotateOrientationLocks(const VEulerRotation &toTest,
                                                         const VEulerRotation &,
                                                         VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VPoint VPxTransform::applyScaleLocksPivot(const VPoint &toTest, const VPoint &,
                                          VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VVector VPxTransform::applyScaleLocksPivotTranslate(const VVector &toTest, const VVector &,
                                                    VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VPoint VPxTransform::applyRotatePivotLocks(const VPoint &toTest, const VPoint &,
                                           VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VVector VPxTransform::applyRotatePivotLocksTranslate(const VVector &toTest, const VVector &,
                                                     VStatus *ReturnStatus) {
  return succeed(ReturnStatus, toTest);
}

VStatus VPxTransform::dirtyMatrix() { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyTranslation(const VVector &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyRotation(const VEulerRotation &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyScale(const VVector &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyShear(const VVector &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyRotateOrientation(const VEulerRotation &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyScalePivot(const VPoint &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyScalePivotTranslation(const VVector &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyRotatePivot(const VPoint &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyRotatePivotTranslation(const VVector &) { return VStatus::kSuccess; }
VStatus VPxTransform::dirtyLimits() { return VStatus::kSuccess; }

VObject VPxTransform::nodeBoundingBox = standin::makeAttribute("VPxTransform.nodeBoundingBox");
VObject VPxTransform::nodeBoundingBoxMin =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMin");
VObject VPxTransform::nodeBoundingBoxMinX =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMinX");
VObject VPxTransform::nodeBoundingBoxMinY =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMinY");
VObject VPxTransform::nodeBoundingBoxMinZ =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMinZ");
VObject VPxTransform::nodeBoundingBoxMax =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMax");
VObject VPxTransform::nodeBoundingBoxMaxX =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMaxX");
VObject VPxTransform::nodeBoundingBoxMaxY =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMaxY");
VObject VPxTransform::nodeBoundingBoxMaxZ =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxMaxZ");
VObject VPxTransform::nodeBoundingBoxSize =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSize");
VObject VPxTransform::nodeBoundingBoxSizeX =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSizeX");
VObject VPxTransform::nodeBoundingBoxSizeY =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSizeY");
VObject VPxTransform::nodeBoundingBoxSizeZ =
    standin::makeAttribute("VPxTransform.nodeBoundingBoxSizeZ");
VObject VPxTransform::center = standin::makeAttribute("VPxTransform.center");
VObject VPxTransform::boundingBoxCenterX =
    standin::makeAttribute("VPxTransform.boundingBoxCenterX");
VObject VPxTransform::boundingBoxCenterY =
    standin::makeAttribute("VPxTransform.boundingBoxCenterY");
VObject VPxTransform::boundingBoxCenterZ =
    standin::makeAttribute("VPxTransform.boundingBoxCenterZ");
VObject VPxTransform::matrix = standin::bases::matrix("matrix", "m", true);
VObject VPxTransform::inverseMatrix = standin::makeAttribute("VPxTransform.inverseMatrix");
VObject VPxTransform::worldMatrix = standin::makeAttribute("VPxTransform.worldMatrix");
VObject VPxTransform::worldInverseMatrix =
    standin::makeAttribute("VPxTransform.worldInverseMatrix");
VObject VPxTransform::parentMatrix = standin::makeAttribute("VPxTransform.parentMatrix");
VObject VPxTransform::parentInverseMatrix =
    standin::makeAttribute("VPxTransform.parentInverseMatrix");
VObject VPxTransform::visibility = standin::makeAttribute("VPxTransform.visibility");
VObject VPxTransform::intermediateObject =
    standin::makeAttribute("VPxTransform.intermediateObject");
VObject VPxTransform::isTemplated = standin::makeAttribute("VPxTransform.isTemplated");
VObject VPxTransform::ghosting = standin::makeAttribute("VPxTransform.ghosting");
VObject VPxTransform::instObjGroups = standin::makeAttribute("VPxTransform.instObjGroups");
VObject VPxTransform::objectGroups = standin::makeAttribute("VPxTransform.objectGroups");
VObject VPxTransform::objectGrpCompList = standin::makeAttribute("VPxTransform.objectGrpCompList");
VObject VPxTransform::objectGroupId = standin::makeAttribute("VPxTransform.objectGroupId");
VObject VPxTransform::objectGroupColor = standin::makeAttribute("VPxTransform.objectGroupColor");
VObject VPxTransform::useObjectColor = standin::makeAttribute("VPxTransform.useObjectColor");
VObject VPxTransform::objectColor = standin::makeAttribute("VPxTransform.objectColor");
VObject VPxTransform::drawOverride = standin::makeAttribute("VPxTransform.drawOverride");
VObject VPxTransform::overrideDisplayType =
    standin::makeAttribute("VPxTransform.overrideDisplayType");
VObject VPxTransform::overrideLevelOfDetail =
    standin::makeAttribute("VPxTransform.overrideLevelOfDetail");
VObject VPxTransform::overrideShading = standin::makeAttribute("VPxTransform.overrideShading");
VObject VPxTransform::overrideTexturing = standin::makeAttribute("VPxTransform.overrideTexturing");
VObject VPxTransform::overridePlayback = standin::makeAttribute("VPxTransform.overridePlayback");
VObject VPxTransform::overrideEnabled = standin::makeAttribute("VPxTransform.overrideEnabled");
VObject VPxTransform::overrideVisibility =
    standin::makeAttribute("VPxTransform.overrideVisibility");
VObject VPxTransform::overrideColor = standin::makeAttribute("VPxTransform.overrideColor");
VObject VPxTransform::lodVisibility = standin::makeAttribute("VPxTransform.lodVisibility");
VObject VPxTransform::renderInfo = standin::makeAttribute("VPxTransform.renderInfo");
VObject VPxTransform::identification = standin::makeAttribute("VPxTransform.identification");
VObject VPxTransform::layerRenderable = standin::makeAttribute("VPxTransform.layerRenderable");
VObject VPxTransform::layerOverrideColor =
    standin::makeAttribute("VPxTransform.layerOverrideColor");
VObject VPxTransform::renderLayerInfo = standin::makeAttribute("VPxTransform.renderLayerInfo");
VObject VPxTransform::renderLayerId = standin::makeAttribute("VPxTransform.renderLayerId");
VObject VPxTransform::renderLayerRenderable =
    standin::makeAttribute("VPxTransform.renderLayerRenderable");
VObject VPxTransform::renderLayerColor = standin::makeAttribute("VPxTransform.renderLayerColor");
VObject VPxTransform::translate = standin::bases::triple("translate", "t", 0.0);
VObject VPxTransform::translateX = standin::makeAttribute("VPxTransform.translateX");
VObject VPxTransform::translateY = standin::makeAttribute("VPxTransform.translateY");
VObject VPxTransform::translateZ = standin::makeAttribute("VPxTransform.translateZ");
VObject VPxTransform::rotate = standin::bases::triple("rotate", "r", 0.0);
VObject VPxTransform::rotateX = standin::makeAttribute("VPxTransform.rotateX");
VObject VPxTransform::rotateY = standin::makeAttribute("VPxTransform.rotateY");
VObject VPxTransform::rotateZ = standin::makeAttribute("VPxTransform.rotateZ");
VObject VPxTransform::rotateOrder = standin::makeAttribute("VPxTransform.rotateOrder");
VObject VPxTransform::scale = standin::bases::triple("scale", "s", 1.0);
VObject VPxTransform::scaleX = standin::makeAttribute("VPxTransform.scaleX");
VObject VPxTransform::scaleY = standin::makeAttribute("VPxTransform.scaleY");
VObject VPxTransform::scaleZ = standin::makeAttribute("VPxTransform.scaleZ");
VObject VPxTransform::shear = standin::makeAttribute("VPxTransform.shear");
VObject VPxTransform::shearXY = standin::makeAttribute("VPxTransform.shearXY");
VObject VPxTransform::shearXZ = standin::makeAttribute("VPxTransform.shearXZ");
VObject VPxTransform::shearYZ = standin::makeAttribute("VPxTransform.shearYZ");
VObject VPxTransform::rotatePivot = standin::makeAttribute("VPxTransform.rotatePivot");
VObject VPxTransform::rotatePivotX = standin::makeAttribute("VPxTransform.rotatePivotX");
VObject VPxTransform::rotatePivotY = standin::makeAttribute("VPxTransform.rotatePivotY");
VObject VPxTransform::rotatePivotZ = standin::makeAttribute("VPxTransform.rotatePivotZ");
VObject VPxTransform::rotatePivotTranslate =
    standin::makeAttribute("VPxTransform.rotatePivotTranslate");
VObject VPxTransform::rotatePivotTranslateX =
    standin::makeAttribute("VPxTransform.rotatePivotTranslateX");
VObject VPxTransform::rotatePivotTranslateY =
    standin::makeAttribute("VPxTransform.rotatePivotTranslateY");
VObject VPxTransform::rotatePivotTranslateZ =
    standin::makeAttribute("VPxTransform.rotatePivotTranslateZ");
VObject VPxTransform::scalePivot = standin::makeAttribute("VPxTransform.scalePivot");
VObject VPxTransform::scalePivotX = standin::makeAttribute("VPxTransform.scalePivotX");
VObject VPxTransform::scalePivotY = standin::makeAttribute("VPxTransform.scalePivotY");
VObject VPxTransform::scalePivotZ = standin::makeAttribute("VPxTransform.scalePivotZ");
VObject VPxTransform::scalePivotTranslate =
    standin::makeAttribute("VPxTransform.scalePivotTranslate");
VObject VPxTransform::scalePivotTranslateX =
    standin::makeAttribute("VPxTransform.scalePivotTranslateX");
VObject VPxTransform::scalePivotTranslateY =
    standin::makeAttribute("VPxTransform.scalePivotTranslateY");
VObject VPxTransform::scalePivotTranslateZ =
    standin::makeAttribute("VPxTransform.scalePivotTranslateZ");
VObject VPxTransform::rotateAxis = standin::makeAttribute("VPxTransform.rotateAxis");
VObject VPxTransform::rotateAxisX = standin::makeAttribute("VPxTransform.rotateAxisX");
VObject VPxTransform::rotateAxisY = standin::makeAttribute("VPxTransform.rotateAxisY");
VObject VPxTransform::rotateAxisZ = standin::makeAttribute("VPxTransform.rotateAxisZ");
VObject VPxTransform::transMinusRotatePivot =
    standin::makeAttribute("VPxTransform.transMinusRotatePivot");
VObject VPxTransform::transMinusRotatePivotX =
    standin::makeAttribute("VPxTransform.transMinusRotatePivotX");
VObject VPxTransform::transMinusRotatePivotY =
    standin::makeAttribute("VPxTransform.transMinusRotatePivotY");
VObject VPxTransform::transMinusRotatePivotZ =
    standin::makeAttribute("VPxTransform.transMinusRotatePivotZ");
VObject VPxTransform::minTransLimit = standin::makeAttribute("VPxTransform.minTransLimit");
VObject VPxTransform::minTransXLimit = standin::makeAttribute("VPxTransform.minTransXLimit");
VObject VPxTransform::minTransYLimit = standin::makeAttribute("VPxTransform.minTransYLimit");
VObject VPxTransform::minTransZLimit = standin::makeAttribute("VPxTransform.minTransZLimit");
VObject VPxTransform::maxTransLimit = standin::makeAttribute("VPxTransform.maxTransLimit");
VObject VPxTransform::maxTransXLimit = standin::makeAttribute("VPxTransform.maxTransXLimit");
VObject VPxTransform::maxTransYLimit = standin::makeAttribute("VPxTransform.maxTransYLimit");
VObject VPxTransform::maxTransZLimit = standin::makeAttribute("VPxTransform.maxTransZLimit");
VObject VPxTransform::minTransLimitEnable =
    standin::makeAttribute("VPxTransform.minTransLimitEnable");
VObject VPxTransform::minTransXLimitEnable =
    standin::makeAttribute("VPxTransform.minTransXLimitEnable");
VObject VPxTransform::minTransYLimitEnable =
    standin::makeAttribute("VPxTransform.minTransYLimitEnable");
VObject VPxTransform::minTransZLimitEnable =
    standin::makeAttribute("VPxTransform.minTransZLimitEnable");
VObject VPxTransform::maxTransLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransLimitEnable");
VObject VPxTransform::maxTransXLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransXLimitEnable");
VObject VPxTransform::maxTransYLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransYLimitEnable");
VObject VPxTransform::maxTransZLimitEnable =
    standin::makeAttribute("VPxTransform.maxTransZLimitEnable");
VObject VPxTransform::minRotLimit = standin::makeAttribute("VPxTransform.minRotLimit");
VObject VPxTransform::minRotXLimit = standin::makeAttribute("VPxTransform.minRotXLimit");
VObject VPxTransform::minRotYLimit = standin::makeAttribute("VPxTransform.minRotYLimit");
VObject VPxTransform::minRotZLimit = standin::makeAttribute("VPxTransform.minRotZLimit");
VObject VPxTransform::maxRotLimit = standin::makeAttribute("VPxTransform.maxRotLimit");
VObject VPxTransform::maxRotXLimit = standin::makeAttribute("VPxTransform.maxRotXLimit");
VObject VPxTransform::maxRotYLimit = standin::makeAttribute("VPxTransform.maxRotYLimit");
VObject VPxTransform::maxRotZLimit = standin::makeAttribute("VPxTransform.maxRotZLimit");
VObject VPxTransform::minRotLimitEnable = standin::makeAttribute("VPxTransform.minRotLimitEnable");
VObject VPxTransform::minRotXLimitEnable =
    standin::makeAttribute("VPxTransform.minRotXLimitEnable");
VObject VPxTransform::minRotYLimitEnable =
    standin::makeAttribute("VPxTransform.minRotYLimitEnable");
VObject VPxTransform::minRotZLimitEnable =
    standin::makeAttribute("VPxTransform.minRotZLimitEnable");
VObject VPxTransform::maxRotLimitEnable = standin::makeAttribute("VPxTransform.maxRotLimitEnable");
VObject VPxTransform::maxRotXLimitEnable =
    standin::makeAttribute("VPxTransform.maxRotXLimitEnable");
VObject VPxTransform::maxRotYLimitEnable =
    standin::makeAttribute("VPxTransform.maxRotYLimitEnable");
VObject VPxTransform::maxRotZLimitEnable =
    standin::makeAttribute("VPxTransform.maxRotZLimitEnable");
VObject VPxTransform::minScaleLimit = standin::makeAttribute("VPxTransform.minScaleLimit");
VObject VPxTransform::minScaleXLimit = standin::makeAttribute("VPxTransform.minScaleXLimit");
VObject VPxTransform::minScaleYLimit = standin::makeAttribute("VPxTransform.minScaleYLimit");
VObject VPxTransform::minScaleZLimit = standin::makeAttribute("VPxTransform.minScaleZLimit");
VObject VPxTransform::maxScaleLimit = standin::makeAttribute("VPxTransform.maxScaleLimit");
VObject VPxTransform::maxScaleXLimit = standin::makeAttribute("VPxTransform.maxScaleXLimit");
VObject VPxTransform::maxScaleYLimit = standin::makeAttribute("VPxTransform.maxScaleYLimit");
VObject VPxTransform::maxScaleZLimit = standin::makeAttribute("VPxTransform.maxScaleZLimit");
VObject VPxTransform::minScaleLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleLimitEnable");
VObject VPxTransform::minScaleXLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleXLimitEnable");
VObject VPxTransform::minScaleYLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleYLimitEnable");
VObject VPxTransform::minScaleZLimitEnable =
    standin::makeAttribute("VPxTransform.minScaleZLimitEnable");
VObject VPxTransform::maxScaleLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleLimitEnable");
VObject VPxTransform::maxScaleXLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleXLimitEnable");
VObject VPxTransform::maxScaleYLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleYLimitEnable");
VObject VPxTransform::maxScaleZLimitEnable =
    standin::makeAttribute("VPxTransform.maxScaleZLimitEnable");
VObject VPxTransform::geometry = standin::makeAttribute("VPxTransform.geometry");
VObject VPxTransform::xformMatrix = standin::makeAttribute("VPxTransform.xformMatrix");
VObject VPxTransform::selectHandle = standin::makeAttribute("VPxTransform.selectHandle");
VObject VPxTransform::selectHandleX = standin::makeAttribute("VPxTransform.selectHandleX");
VObject VPxTransform::selectHandleY = standin::makeAttribute("VPxTransform.selectHandleY");
VObject VPxTransform::selectHandleZ = standin::makeAttribute("VPxTransform.selectHandleZ");
VObject VPxTransform::inheritsTransform = standin::makeAttribute("VPxTransform.inheritsTransform");
VObject VPxTransform::displayHandle = standin::makeAttribute("VPxTransform.displayHandle");
VObject VPxTransform::displayScalePivot = standin::makeAttribute("VPxTransform.displayScalePivot");
VObject VPxTransform::displayRotatePivot =
    standin::makeAttribute("VPxTransform.displayRotatePivot");
VObject VPxTransform::displayLocalAxis = standin::makeAttribute("VPxTransform.displayLocalAxis");
VObject VPxTransform::dynamics = standin::makeAttribute("VPxTransform.dynamics");
VObject VPxTransform::showManipDefault = standin::makeAttribute("VPxTransform.showManipDefault");
VObject VPxTransform::specifiedManipLocation =
    standin::makeAttribute("VPxTransform.specifiedManipLocation");
VObject VPxTransform::rotateQuaternion = standin::makeAttribute("VPxTransform.rotateQuaternion");
VObject VPxTransform::rotateQuaternionX = standin::makeAttribute("VPxTransform.rotateQuaternionX");
VObject VPxTransform::rotateQuaternionY = standin::makeAttribute("VPxTransform.rotateQuaternionY");
VObject VPxTransform::rotateQuaternionZ = standin::makeAttribute("VPxTransform.rotateQuaternionZ");
VObject VPxTransform::rotateQuaternionW = standin::makeAttribute("VPxTransform.rotateQuaternionW");
VObject VPxTransform::rotationInterpolation =
    standin::makeAttribute("VPxTransform.rotationInterpolation");
VObject VPxTransform::offsetParentMatrix =
    standin::makeAttribute("VPxTransform.offsetParentMatrix");

OPENVORLA_NAMESPACE_CLOSE
