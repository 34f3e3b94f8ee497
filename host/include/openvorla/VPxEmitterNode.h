// Base class of plug-in particle emitters.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxEmitterNode : public VPxNode {
public:
  enum EmitterType {
    kDirectional,
    kOmni,
    kSurface,
    kCurve,
    kVolume
  };

  VPxEmitterNode();
  ~VPxEmitterNode() override;

  static VObject mEmitterType;
  static VObject mRate;
  static VObject mSpeed;
  static VObject mDirection;
  static VObject mDirectionX;
  static VObject mDirectionY;
  static VObject mDirectionZ;
  static VObject mOwnerPosData;
  static VObject mOwnerVelData;
  static VObject mOwnerCentroid;
  static VObject mOwnerCentroidX;
  static VObject mOwnerCentroidY;
  static VObject mOwnerCentroidZ;
  static VObject mSweptGeometry;
  static VObject mWorldMatrix;
  static VObject mStartTime;
  static VObject mDeltaTime;
  static VObject mIsFull;
  static VObject mInheritFactor;
  static VObject mSeed;
  static VObject mRandState;
  static VObject mRandStateX;
  static VObject mRandStateY;
  static VObject mRandStateZ;
  static VObject mCurrentTime;
  static VObject mOutput;
  static VObject mMinDistance;
  static VObject mMaxDistance;
};

OPENVORLA_NAMESPACE_CLOSE
