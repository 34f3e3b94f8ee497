// Base class of plug-in motion path nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxMotionPathNode : public VPxNode {
public:
  enum WorldUpType {
    kUpScene,
    kUpObject,
    kUpObjectRotation,
    kUpVector,
    kUpNormal
  };

  VPxMotionPathNode();
  ~VPxMotionPathNode() override;

  // The path's point at the block's uValue, or at the parameter u. The
  // stand-in's paths have no curve: the point is (u, 0, 0).
  VPoint position(VDataBlock &block, VStatus *ReturnStatus = NULL);
  VPoint position(double u, VStatus *ReturnStatus = NULL);
  // The front, side and up vectors at the block's uValue, from the path's
  // axes and world-up settings.
  VStatus getVectors(VDataBlock &block, VVector &front, VVector &side, VVector &up);
  // Between the curve's parameter and the fraction of its length; the
  // stand-in's paths run from 0 to 1 at constant speed.
  double parametricToFractional(double u, VStatus *ReturnStatus = NULL);
  double fractionalToParametric(double fraction, VStatus *ReturnStatus = NULL);
  // Values past either end, wrapped back onto the path.
  double wraparoundFractionalValue(double fraction);
  double wraparoundParametricValue(double u);
  // The matrix at the block's uValue: the orientation along the path and
  // the position on it.
  VMatrix matrix(VDataBlock &block, VStatus *ReturnStatus = NULL);
  // The curve the node moves along; the null object while none is connected.
  VObject pathObject(VDataBlock &block, VStatus *ReturnStatus = NULL);
  static const char *className();

  static VObject uValue;
  static VObject frontTwist;
  static VObject upTwist;
  static VObject sideTwist;
  static VObject flowNode;
  static VObject pathGeometry;
  static VObject positionMarkerTime;
  static VObject orientationMarkerTime;
  static VObject follow;
  static VObject normal;
  static VObject inverseUp;
  static VObject inverseFront;
  static VObject frontAxis;
  static VObject upAxis;
  static VObject worldUpType;
  static VObject worldUpVector;
  static VObject worldUpVectorX;
  static VObject worldUpVectorY;
  static VObject worldUpVectorZ;
  static VObject worldUpMatrix;
  static VObject bank;
  static VObject bankScale;
  static VObject bankThreshold;
  static VObject fractionMode;
  static VObject updateOrientationMarkers;
  static VObject allCoordinates;
  static VObject xCoordinate;
  static VObject yCoordinate;
  static VObject zCoordinate;
  static VObject orientMatrix;
  static VObject rotate;
  static VObject rotateX;
  static VObject rotateY;
  static VObject rotateZ;
  static VObject rotateOrder;
};

OPENVORLA_NAMESPACE_CLOSE
