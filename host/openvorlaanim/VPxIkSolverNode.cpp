// VPxIkSolverNode: the solver settings, the chain's joint angles and the
// default solve.
#include <openvorla/VPxIkSolverNode.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxIkSolverNode::VPxIkSolverNode()
    : fRotatePlane(false),
      fSingleChainOnly(false),
      fPositionOnly(false),
      fSupportJointLimits(false),
      fUniqueSolution(false),
      fFuncValueTolerance(1.0e-5),
      fMaxIterations(100),
      fHandleGroup(nullptr) {
  standin::noteConstructed("VPxIkSolverNode");
}

VPxIkSolverNode::~VPxIkSolverNode() { standin::noteDestroyed("VPxIkSolverNode"); }

VPxNode::Type VPxIkSolverNode::type() const { return kIkSolverNode; }

VStatus VPxIkSolverNode::preSolve() { return VStatus::kSuccess; }
VStatus VPxIkSolverNode::doSolve() { return VStatus::kNotImplemented; }
VStatus VPxIkSolverNode::postSolve(VStatus stat) { return stat; }
VString VPxIkSolverNode::solverTypeName() const { return VString(); }

bool VPxIkSolverNode::isSingleChainOnly() const { return fSingleChainOnly; }
bool VPxIkSolverNode::isPositionOnly() const { return fPositionOnly; }
bool VPxIkSolverNode::hasJointLimitSupport() const { return fSupportJointLimits; }
bool VPxIkSolverNode::hasUniqueSolution() const { return fUniqueSolution; }
bool VPxIkSolverNode::rotatePlane() const { return fRotatePlane; }
bool VPxIkSolverNode::groupHandlesByTopology() const { return false; }
void VPxIkSolverNode::snapHandle(VObject &) {}
void VPxIkSolverNode::setFuncValueTolerance(double tolerance) { fFuncValueTolerance = tolerance; }
void VPxIkSolverNode::setMaxIterations(int value) { fMaxIterations = value; }
bool VPxIkSolverNode::isAttributeCreatedBySolver(const VObject &) { return false; }

void VPxIkSolverNode::setRotatePlane(bool rotatePlane) { fRotatePlane = rotatePlane; }
void VPxIkSolverNode::setSingleChainOnly(bool singleChainOnly) {
  fSingleChainOnly = singleChainOnly;
}
void VPxIkSolverNode::setPositionOnly(bool positionOnly) { fPositionOnly = positionOnly; }
void VPxIkSolverNode::setSupportJointLimits(bool supportJointLimits) {
  fSupportJointLimits = supportJointLimits;
}
void VPxIkSolverNode::setUniqueSolution(bool uniqueSolution) { fUniqueSolution = uniqueSolution; }
double VPxIkSolverNode::funcValueTolerance() const { return fFuncValueTolerance; }
int VPxIkSolverNode::maxIterations() const { return fMaxIterations; }

VIkHandleGroup *VPxIkSolverNode::handleGroup() const { return fHandleGroup; }
void VPxIkSolverNode::setHandleGroup(VIkHandleGroup *group) { fHandleGroup = group; }
VObject VPxIkSolverNode::currentHandle() const { return fCurrentHandle; }

VStatus VPxIkSolverNode::setCurrentHandle(VObject &handle) {
  fCurrentHandle = handle;
  return VStatus::kSuccess;
}

// The stand-in's chains are not placed in the scene: their space is the world.
void VPxIkSolverNode::toWorldSpace(VPoint &) {}
void VPxIkSolverNode::toWorldSpace(VVector &) {}
void VPxIkSolverNode::toSolverSpace(VPoint &) {}
void VPxIkSolverNode::toSolverSpace(VVector &) {}

VStatus VPxIkSolverNode::getJointAngles(VDoubleArray &angles) const {
  angles = fJointAngles;
  return VStatus::kSuccess;
}

VStatus VPxIkSolverNode::setJointAngles(const VDoubleArray &angles) {
  fJointAngles = angles;
  return VStatus::kSuccess;
}

unsigned int VPxIkSolverNode::jointCount() const { return fJointAngles.length() / 3; }

double VPxIkSolverNode::jointAngle(unsigned int index) const {
  return index < fJointAngles.length() ? fJointAngles[index] : 0.0;
}

VStatus VPxIkSolverNode::setJointAngle(unsigned int index, double angle) {
  return fJointAngles.set(angle, index);
}

void VPxIkSolverNode::setToRestAngles() {
  for (unsigned int i = 0; i < fJointAngles.length(); ++i) fJointAngles[i] = 0.0;
}

const char *VPxIkSolverNode::className() { return "VPxIkSolverNode"; }

OPENVORLA_NAMESPACE_CLOSE
