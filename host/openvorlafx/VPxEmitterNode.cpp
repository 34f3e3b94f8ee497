// VPxEmitterNode: construction and the static attribute objects.
#include <openvorla/VPxEmitterNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VPxEmitterNode::VPxEmitterNode() : fRandomState(0) { standin::noteConstructed("VPxEmitterNode"); }
VPxEmitterNode::~VPxEmitterNode() { standin::noteDestroyed("VPxEmitterNode"); }

VPxNode::Type VPxEmitterNode::type() const { return kEmitterNode; }

// The unit cube around the emitter's origin.
bool VPxEmitterNode::volumePrimitivePointInside(const VPoint &worldPoint,
                                                const VMatrix &emitterWorldMatrix) {
  VPoint local = worldPoint * emitterWorldMatrix.inverse();
  if (!local.cartesianize()) return false;
  return std::fabs(local.x) <= 0.5 && std::fabs(local.y) <= 0.5 && std::fabs(local.z) <= 0.5;
}

// The stand-in's blocks hold one value per attribute, so every output reads
// the same start and step times.
VTime VPxEmitterNode::getCurrentTime(VDataBlock &block) {
  return VTime(block.inputValue(mCurrentTime).asDouble());
}

VTime VPxEmitterNode::getStartTime(int, VDataBlock &block) {
  return VTime(block.inputValue(mStartTime).asDouble());
}

VTime VPxEmitterNode::getDeltaTime(int, VDataBlock &block) {
  return VTime(block.inputValue(mDeltaTime).asDouble());
}

double VPxEmitterNode::getRate(VDataBlock &block) { return block.inputValue(mRate).asDouble(); }

double VPxEmitterNode::getMinDistance(VDataBlock &block) {
  return block.inputValue(mMinDistance).asDouble();
}

double VPxEmitterNode::getMaxDistance(VDataBlock &block) {
  return block.inputValue(mMaxDistance).asDouble();
}

int VPxEmitterNode::getEmitterType(VDataBlock &block) {
  return block.inputValue(mEmitterType).asInt();
}

int VPxEmitterNode::getRandomSeed(VDataBlock &block, int) {
  return block.inputValue(mSeed).asInt();
}

// Nor do they hold arrays: the owner has no points.
VStatus VPxEmitterNode::getOwnerPositions(VDataBlock &, VVectorArray &positions) {
  return positions.clear();
}

VStatus VPxEmitterNode::getOwnerVelocities(VDataBlock &, VVectorArray &velocities) {
  return velocities.clear();
}

VObject VPxEmitterNode::getOwnerShape() { return VObject(); }

VStatus VPxEmitterNode::getWorldPosition(VPoint &point) {
  point = VPoint();
  return VStatus::kSuccess;
}

VStatus VPxEmitterNode::getWorldMatrix(VMatrix &matrix) {
  matrix.setToIdentity();
  return VStatus::kSuccess;
}

void VPxEmitterNode::resetRandomState(int plugIndex, VDataBlock &block) {
  fRandomState = static_cast<unsigned int>(getRandomSeed(block, plugIndex));
}

void VPxEmitterNode::getRandomState(int, VDataBlock &block) {
  fRandomState = static_cast<unsigned int>(block.inputValue(mRandStateX).asDouble());
}

void VPxEmitterNode::setRandomState(int, VDataBlock &block) {
  // A double holds every 32-bit state exactly; an int would not.
  block.outputValue(mRandStateX).setDouble(fRandomState);
}

// A linear congruential generator: the same seed gives the same numbers.
double VPxEmitterNode::randgen() {
  fRandomState = fRandomState * 1103515245u + 12345u;
  return ((fRandomState >> 8) & 0xffffffu) / 16777216.0;
}

void VPxEmitterNode::volumePrimitiveBoundingBox(VBoundingBox &box) {
  box = VBoundingBox(VPoint(-0.5, -0.5, -0.5), VPoint(0.5, 0.5, 0.5));
}

// The distance from the emitter's y axis.
bool VPxEmitterNode::volumePrimitiveDistanceFromAxis(const VPoint &worldPoint, double &distance) {
  distance = std::sqrt(worldPoint.x * worldPoint.x + worldPoint.z * worldPoint.z);
  return true;
}

// The stand-in connects no textures.
bool VPxEmitterNode::hasValidEmission2dTexture(const VObject &, VStatus *ReturnStatus) {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return false;
}

VStatus VPxEmitterNode::evalEmission2dTexture(const VObject &, VDoubleArray &, VDoubleArray &,
                                              VVectorArray *, VDoubleArray *) {
  return VStatus(VStatus::kFailure, "No texture is connected to the attribute");
}

const char *VPxEmitterNode::className() { return "VPxEmitterNode"; }

VObject VPxEmitterNode::mEmitterType = standin::makeAttribute("VPxEmitterNode.mEmitterType");
VObject VPxEmitterNode::mRate = standin::makeAttribute("VPxEmitterNode.mRate");
VObject VPxEmitterNode::mSpeed = standin::makeAttribute("VPxEmitterNode.mSpeed");
VObject VPxEmitterNode::mDirection = standin::makeAttribute("VPxEmitterNode.mDirection");
VObject VPxEmitterNode::mDirectionX = standin::makeAttribute("VPxEmitterNode.mDirectionX");
VObject VPxEmitterNode::mDirectionY = standin::makeAttribute("VPxEmitterNode.mDirectionY");
VObject VPxEmitterNode::mDirectionZ = standin::makeAttribute("VPxEmitterNode.mDirectionZ");
VObject VPxEmitterNode::mOwnerPosData = standin::makeAttribute("VPxEmitterNode.mOwnerPosData");
VObject VPxEmitterNode::mOwnerVelData = standin::makeAttribute("VPxEmitterNode.mOwnerVelData");
VObject VPxEmitterNode::mOwnerCentroid = standin::makeAttribute("VPxEmitterNode.mOwnerCentroid");
VObject VPxEmitterNode::mOwnerCentroidX = standin::makeAttribute("VPxEmitterNode.mOwnerCentroidX");
VObject VPxEmitterNode::mOwnerCentroidY = standin::makeAttribute("VPxEmitterNode.mOwnerCentroidY");
VObject VPxEmitterNode::mOwnerCentroidZ = standin::makeAttribute("VPxEmitterNode.mOwnerCentroidZ");
VObject VPxEmitterNode::mSweptGeometry = standin::makeAttribute("VPxEmitterNode.mSweptGeometry");
VObject VPxEmitterNode::mWorldMatrix = standin::makeAttribute("VPxEmitterNode.mWorldMatrix");
VObject VPxEmitterNode::mStartTime = standin::makeAttribute("VPxEmitterNode.mStartTime");
VObject VPxEmitterNode::mDeltaTime = standin::makeAttribute("VPxEmitterNode.mDeltaTime");
VObject VPxEmitterNode::mIsFull = standin::makeAttribute("VPxEmitterNode.mIsFull");
VObject VPxEmitterNode::mInheritFactor = standin::makeAttribute("VPxEmitterNode.mInheritFactor");
VObject VPxEmitterNode::mSeed = standin::makeAttribute("VPxEmitterNode.mSeed");
VObject VPxEmitterNode::mRandState = standin::makeAttribute("VPxEmitterNode.mRandState");
VObject VPxEmitterNode::mRandStateX = standin::makeAttribute("VPxEmitterNode.mRandStateX");
VObject VPxEmitterNode::mRandStateY = standin::makeAttribute("VPxEmitterNode.mRandStateY");
VObject VPxEmitterNode::mRandStateZ = standin::makeAttribute("VPxEmitterNode.mRandStateZ");
VObject VPxEmitterNode::mCurrentTime = standin::makeAttribute("VPxEmitterNode.mCurrentTime");
VObject VPxEmitterNode::mOutput = standin::makeAttribute("VPxEmitterNode.mOutput");
VObject VPxEmitterNode::mMinDistance = standin::makeAttribute("VPxEmitterNode.mMinDistance");
VObject VPxEmitterNode::mMaxDistance = standin::makeAttribute("VPxEmitterNode.mMaxDistance");

OPENVORLA_NAMESPACE_CLOSE
