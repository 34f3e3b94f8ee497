// VPxEmitterNode: construction and the static attribute objects.
#include <openvorla/VPxEmitterNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxEmitterNode::VPxEmitterNode() { standin::noteConstructed("VPxEmitterNode"); }
VPxEmitterNode::~VPxEmitterNode() { standin::noteDestroyed("VPxEmitterNode"); }

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
