// Base class of plug-in motion path nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

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
