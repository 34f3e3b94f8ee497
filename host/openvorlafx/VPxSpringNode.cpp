// VPxSpringNode: construction and the static attribute objects.
#include <openvorla/VPxSpringNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxSpringNode::VPxSpringNode() { standin::noteConstructed("VPxSpringNode"); }
VPxSpringNode::~VPxSpringNode() { standin::noteDestroyed("VPxSpringNode"); }

VPxNode::Type VPxSpringNode::type() const { return kSpringNode; }

// Stretching pulls the ends together, and the ends' approach along the spring
// is damped. Ends at one place have no direction between them: no force.
VStatus VPxSpringNode::applySpringLaw(double stiffness, double damping, double restLength, double,
                                      double, const VVector &endP1, const VVector &endP2,
                                      const VVector &endV1, const VVector &endV2, VVector &forceV1,
                                      VVector &forceV2) {
  VVector along = endP2 - endP1;
  double length = along.length();
  if (length == 0.0) {
    forceV1 = forceV2 = VVector();
    return VStatus::kSuccess;
  }
  VVector direction = along / length;
  double stretch = length - restLength;
  double closing = (endV2 - endV1) * direction;
  forceV1 = direction * (stiffness * stretch + damping * closing);
  forceV2 = -forceV1;
  return VStatus::kSuccess;
}

const char *VPxSpringNode::className() { return "VPxSpringNode"; }

VObject VPxSpringNode::mEnd1Weight = standin::makeAttribute("VPxSpringNode.mEnd1Weight");
VObject VPxSpringNode::mEnd2Weight = standin::makeAttribute("VPxSpringNode.mEnd2Weight");
VObject VPxSpringNode::mDeltaTime = standin::makeAttribute("VPxSpringNode.mDeltaTime");

OPENVORLA_NAMESPACE_CLOSE
