// Base class of plug-in dynamics fields.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxFieldNode : public VPxNode {
public:
  VPxFieldNode();
  ~VPxFieldNode() override;

  static VObject mMagnitude;
  static VObject mAttenuation;
  static VObject mMaxDistance;
  static VObject mUseMaxDistance;
  static VObject mApplyPerVertex;
  static VObject mInputData;
  static VObject mInputPositions;
  static VObject mInputVelocities;
  static VObject mInputMass;
  static VObject mDeltaTime;
  static VObject mInputForce;
  static VObject mOutputForce;
  static VObject mOwnerCentroidX;
  static VObject mOwnerCentroidY;
  static VObject mOwnerCentroidZ;
  static VObject mOwnerCentroid;
  static VObject mOwnerPosData;
  static VObject mOwnerVelData;
  static VObject mWorldMatrix;
  static VObject mInputPPData;
  static VObject mOwnerPPData;
};

OPENVORLA_NAMESPACE_CLOSE
