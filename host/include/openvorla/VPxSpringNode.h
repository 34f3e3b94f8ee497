// Base class of plug-in spring solvers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxSpringNode : public VPxNode {
public:
  VPxSpringNode();
  ~VPxSpringNode() override;

  VPxNode::Type type() const override;  // kSpringNode

  // The forces on the two ends of one spring, from its stiffness, damping
  // and rest length and the ends' masses, positions and velocities. The
  // default is Hooke's law with damping along the spring.
  virtual VStatus applySpringLaw(double stiffness, double damping, double restLength,
                                 double endMass1, double endMass2, const VVector &endP1,
                                 const VVector &endP2, const VVector &endV1, const VVector &endV2,
                                 VVector &forceV1, VVector &forceV2);
  static const char *className();

  static VObject mEnd1Weight;
  static VObject mEnd2Weight;
  static VObject mDeltaTime;
};

OPENVORLA_NAMESPACE_CLOSE
