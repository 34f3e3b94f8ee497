// VPxFieldNode: construction and the static attribute objects.
#include <openvorla/VPxFieldNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxFieldNode::VPxFieldNode() { standin::noteConstructed("VPxFieldNode"); }
VPxFieldNode::~VPxFieldNode() { standin::noteDestroyed("VPxFieldNode"); }

VPxNode::Type VPxFieldNode::type() const { return kFieldNode; }

VStatus VPxFieldNode::getForceAtPoint(const VPointArray &, const VVectorArray &,
                                      const VDoubleArray &, VVectorArray &, double) {
  return VStatus::kNotImplemented;
}

VStatus VPxFieldNode::iconSizeAndOrigin(unsigned int &width, unsigned int &height,
                                        unsigned int &xbo, unsigned int &ybo) {
  width = height = xbo = ybo = 0;
  return VStatus::kSuccess;
}

// An icon of no pixels has no bytes to fill.
VStatus VPxFieldNode::iconBitmap(unsigned char *) { return VStatus::kSuccess; }
bool VPxFieldNode::drawIcon() const { return false; }

VStatus VPxFieldNode::falloffCurve(double param, double &value) {
  double clamped = param < 0.0 ? 0.0 : param > 1.0 ? 1.0 : param;
  value = isFalloffCurveConstantOne() ? 1.0 : 1.0 - clamped;
  return VStatus::kSuccess;
}

bool VPxFieldNode::isFalloffCurveConstantOne() { return false; }

// The stand-in does not place fields in the scene.
VStatus VPxFieldNode::getWorldMatrix(VMatrix &matrix) const {
  matrix.setToIdentity();
  return VStatus::kSuccess;
}

const char *VPxFieldNode::className() { return "VPxFieldNode"; }

VObject VPxFieldNode::mMagnitude = standin::makeAttribute("VPxFieldNode.mMagnitude");
VObject VPxFieldNode::mAttenuation = standin::makeAttribute("VPxFieldNode.mAttenuation");
VObject VPxFieldNode::mMaxDistance = standin::makeAttribute("VPxFieldNode.mMaxDistance");
VObject VPxFieldNode::mUseMaxDistance = standin::makeAttribute("VPxFieldNode.mUseMaxDistance");
VObject VPxFieldNode::mApplyPerVertex = standin::makeAttribute("VPxFieldNode.mApplyPerVertex");
VObject VPxFieldNode::mInputData = standin::makeAttribute("VPxFieldNode.mInputData");
VObject VPxFieldNode::mInputPositions = standin::makeAttribute("VPxFieldNode.mInputPositions");
VObject VPxFieldNode::mInputVelocities = standin::makeAttribute("VPxFieldNode.mInputVelocities");
VObject VPxFieldNode::mInputMass = standin::makeAttribute("VPxFieldNode.mInputMass");
VObject VPxFieldNode::mDeltaTime = standin::makeAttribute("VPxFieldNode.mDeltaTime");
VObject VPxFieldNode::mInputForce = standin::makeAttribute("VPxFieldNode.mInputForce");
VObject VPxFieldNode::mOutputForce = standin::makeAttribute("VPxFieldNode.mOutputForce");
VObject VPxFieldNode::mOwnerCentroidX = standin::makeAttribute("VPxFieldNode.mOwnerCentroidX");
VObject VPxFieldNode::mOwnerCentroidY = standin::makeAttribute("VPxFieldNode.mOwnerCentroidY");
VObject VPxFieldNode::mOwnerCentroidZ = standin::makeAttribute("VPxFieldNode.mOwnerCentroidZ");
VObject VPxFieldNode::mOwnerCentroid = standin::makeAttribute("VPxFieldNode.mOwnerCentroid");
VObject VPxFieldNode::mOwnerPosData = standin::makeAttribute("VPxFieldNode.mOwnerPosData");
VObject VPxFieldNode::mOwnerVelData = standin::makeAttribute("VPxFieldNode.mOwnerVelData");
VObject VPxFieldNode::mWorldMatrix = standin::makeAttribute("VPxFieldNode.mWorldMatrix");
VObject VPxFieldNode::mInputPPData = standin::makeAttribute("VPxFieldNode.mInputPPData");
VObject VPxFieldNode::mOwnerPPData = standin::makeAttribute("VPxFieldNode.mOwnerPPData");

OPENVORLA_NAMESPACE_CLOSE
