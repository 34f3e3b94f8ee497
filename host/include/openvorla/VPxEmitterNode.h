// Base class of plug-in particle emitters.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VBoundingBox.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VTime.h>
#include <openvorla/VVectorArray.h>

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

  VPxNode::Type type() const override;  // kEmitterNode

  // Whether worldPoint lies in the volume of a volume emitter placed by
  // emitterWorldMatrix: the unit cube around the origin by default.
  virtual bool volumePrimitivePointInside(const VPoint &worldPoint,
                                          const VMatrix &emitterWorldMatrix);

  // The emitter's attribute values in the block, for compute.
  VTime getCurrentTime(VDataBlock &block);
  VTime getStartTime(int plugIndex, VDataBlock &block);
  VTime getDeltaTime(int plugIndex, VDataBlock &block);
  double getRate(VDataBlock &block);
  double getMinDistance(VDataBlock &block);
  double getMaxDistance(VDataBlock &block);
  int getEmitterType(VDataBlock &block);  // an EmitterType
  int getRandomSeed(VDataBlock &block, int plugIndex = 0);
  // The positions and velocities of the owner's points.
  VStatus getOwnerPositions(VDataBlock &block, VVectorArray &positions);
  VStatus getOwnerVelocities(VDataBlock &block, VVectorArray &velocities);
  // The shape that owns the emitter; the null object for a free emitter.
  VObject getOwnerShape();
  VStatus getWorldPosition(VPoint &point);
  VStatus getWorldMatrix(VMatrix &matrix);

  // The random numbers of output plugIndex: randgen draws the next one in
  // [0, 1); the state is read from the block, kept, and written back.
  void resetRandomState(int plugIndex, VDataBlock &block);
  void getRandomState(int plugIndex, VDataBlock &block);
  void setRandomState(int plugIndex, VDataBlock &block);
  double randgen();

  // The volume of a volume emitter, in its own space.
  void volumePrimitiveBoundingBox(VBoundingBox &box);
  bool volumePrimitiveDistanceFromAxis(const VPoint &worldPoint, double &distance);
  // Emission scaled by a 2D texture connected to texAttr, looked up at the
  // (u, v) coordinates.
  bool hasValidEmission2dTexture(const VObject &texAttr, VStatus *ReturnStatus = NULL);
  VStatus evalEmission2dTexture(const VObject &texAttr, VDoubleArray &uCoords,
                                VDoubleArray &vCoords, VVectorArray *resultColors,
                                VDoubleArray *resultAlphas);
  static const char *className();

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

private:
  unsigned int fRandomState;
};

OPENVORLA_NAMESPACE_CLOSE
