// VPxMotionPathNode: construction and the static attribute objects.
#include <openvorla/VPxMotionPathNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VPxMotionPathNode::VPxMotionPathNode() { standin::noteConstructed("VPxMotionPathNode"); }
VPxMotionPathNode::~VPxMotionPathNode() { standin::noteDestroyed("VPxMotionPathNode"); }

namespace {

VStatus *succeed(VStatus *ReturnStatus) {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return ReturnStatus;
}

double wrapped(double value) { return value - std::floor(value); }

}  // namespace

// The stand-in's paths are the unit segment along x, run at constant speed.
VPoint VPxMotionPathNode::position(VDataBlock &block, VStatus *ReturnStatus) {
  return position(block.inputValue(uValue).asDouble(), ReturnStatus);
}

VPoint VPxMotionPathNode::position(double u, VStatus *ReturnStatus) {
  succeed(ReturnStatus);
  return VPoint(u, 0.0, 0.0);
}

VStatus VPxMotionPathNode::getVectors(VDataBlock &, VVector &front, VVector &side, VVector &up) {
  front = VVector(1.0, 0.0, 0.0);
  side = VVector(0.0, 0.0, 1.0);
  up = VVector(0.0, 1.0, 0.0);
  return VStatus::kSuccess;
}

double VPxMotionPathNode::parametricToFractional(double u, VStatus *ReturnStatus) {
  succeed(ReturnStatus);
  return u;
}

double VPxMotionPathNode::fractionalToParametric(double fraction, VStatus *ReturnStatus) {
  succeed(ReturnStatus);
  return fraction;
}

double VPxMotionPathNode::wraparoundFractionalValue(double fraction) { return wrapped(fraction); }
double VPxMotionPathNode::wraparoundParametricValue(double u) { return wrapped(u); }

VMatrix VPxMotionPathNode::matrix(VDataBlock &block, VStatus *ReturnStatus) {
  succeed(ReturnStatus);
  return VMatrix().setTranslation(position(block).asVector());
}

VObject VPxMotionPathNode::pathObject(VDataBlock &, VStatus *ReturnStatus) {
  succeed(ReturnStatus);
  return VObject();
}

const char *VPxMotionPathNode::className() { return "VPxMotionPathNode"; }

VObject VPxMotionPathNode::uValue = standin::makeAttribute("VPxMotionPathNode.uValue");
VObject VPxMotionPathNode::frontTwist = standin::makeAttribute("VPxMotionPathNode.frontTwist");
VObject VPxMotionPathNode::upTwist = standin::makeAttribute("VPxMotionPathNode.upTwist");
VObject VPxMotionPathNode::sideTwist = standin::makeAttribute("VPxMotionPathNode.sideTwist");
VObject VPxMotionPathNode::flowNode = standin::makeAttribute("VPxMotionPathNode.flowNode");
VObject VPxMotionPathNode::pathGeometry = standin::makeAttribute("VPxMotionPathNode.pathGeometry");
VObject VPxMotionPathNode::positionMarkerTime =
    standin::makeAttribute("VPxMotionPathNode.positionMarkerTime");
VObject VPxMotionPathNode::orientationMarkerTime =
    standin::makeAttribute("VPxMotionPathNode.orientationMarkerTime");
VObject VPxMotionPathNode::follow = standin::makeAttribute("VPxMotionPathNode.follow");
VObject VPxMotionPathNode::normal = standin::makeAttribute("VPxMotionPathNode.normal");
VObject VPxMotionPathNode::inverseUp = standin::makeAttribute("VPxMotionPathNode.inverseUp");
VObject VPxMotionPathNode::inverseFront = standin::makeAttribute("VPxMotionPathNode.inverseFront");
VObject VPxMotionPathNode::frontAxis = standin::makeAttribute("VPxMotionPathNode.frontAxis");
VObject VPxMotionPathNode::upAxis = standin::makeAttribute("VPxMotionPathNode.upAxis");
VObject VPxMotionPathNode::worldUpType = standin::makeAttribute("VPxMotionPathNode.worldUpType");
VObject VPxMotionPathNode::worldUpVector =
    standin::makeAttribute("VPxMotionPathNode.worldUpVector");
VObject VPxMotionPathNode::worldUpVectorX =
    standin::makeAttribute("VPxMotionPathNode.worldUpVectorX");
VObject VPxMotionPathNode::worldUpVectorY =
    standin::makeAttribute("VPxMotionPathNode.worldUpVectorY");
VObject VPxMotionPathNode::worldUpVectorZ =
    standin::makeAttribute("VPxMotionPathNode.worldUpVectorZ");
VObject VPxMotionPathNode::worldUpMatrix =
    standin::makeAttribute("VPxMotionPathNode.worldUpMatrix");
VObject VPxMotionPathNode::bank = standin::makeAttribute("VPxMotionPathNode.bank");
VObject VPxMotionPathNode::bankScale = standin::makeAttribute("VPxMotionPathNode.bankScale");
VObject VPxMotionPathNode::bankThreshold =
    standin::makeAttribute("VPxMotionPathNode.bankThreshold");
VObject VPxMotionPathNode::fractionMode = standin::makeAttribute("VPxMotionPathNode.fractionMode");
VObject VPxMotionPathNode::updateOrientationMarkers =
    standin::makeAttribute("VPxMotionPathNode.updateOrientationMarkers");
VObject VPxMotionPathNode::allCoordinates =
    standin::makeAttribute("VPxMotionPathNode.allCoordinates");
VObject VPxMotionPathNode::xCoordinate = standin::makeAttribute("VPxMotionPathNode.xCoordinate");
VObject VPxMotionPathNode::yCoordinate = standin::makeAttribute("VPxMotionPathNode.yCoordinate");
VObject VPxMotionPathNode::zCoordinate = standin::makeAttribute("VPxMotionPathNode.zCoordinate");
VObject VPxMotionPathNode::orientMatrix = standin::makeAttribute("VPxMotionPathNode.orientMatrix");
VObject VPxMotionPathNode::rotate = standin::makeAttribute("VPxMotionPathNode.rotate");
VObject VPxMotionPathNode::rotateX = standin::makeAttribute("VPxMotionPathNode.rotateX");
VObject VPxMotionPathNode::rotateY = standin::makeAttribute("VPxMotionPathNode.rotateY");
VObject VPxMotionPathNode::rotateZ = standin::makeAttribute("VPxMotionPathNode.rotateZ");
VObject VPxMotionPathNode::rotateOrder = standin::makeAttribute("VPxMotionPathNode.rotateOrder");

OPENVORLA_NAMESPACE_CLOSE
