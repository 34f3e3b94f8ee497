// Base class of plug-in dynamics fields.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPointArray.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VVectorArray.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxFieldNode : public VPxNode {
public:
  VPxFieldNode();
  ~VPxFieldNode() override;

  VPxNode::Type type() const override;  // kFieldNode

  // The field's force on particles of the given positions, velocities and
  // masses over deltaTime, into force (one vector per point).
  // kNotImplemented: the host applies no force.
  virtual VStatus getForceAtPoint(const VPointArray &point, const VVectorArray &velocity,
                                  const VDoubleArray &mass, VVectorArray &force, double deltaTime);
  // The field's icon: its size and origin in pixels, then the bitmap (one
  // bit per pixel, rows of whole bytes). No icon by default.
  virtual VStatus iconSizeAndOrigin(unsigned int &width, unsigned int &height, unsigned int &xbo,
                                    unsigned int &ybo);
  virtual VStatus iconBitmap(unsigned char *bitmap);
  virtual bool drawIcon() const;
  // The falloff along the distance (param 0 at the field, 1 at its maximum
  // distance): 1 - param by default, or 1 everywhere when constant.
  virtual VStatus falloffCurve(double param, double &value);
  virtual bool isFalloffCurveConstantOne();

  VStatus getWorldMatrix(VMatrix &matrix) const;
  static const char *className();

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
