// Base class of plug-in inverse-kinematics solvers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VObject.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class VIkHandleGroup;

class OPENVORLA_EXPORT VPxIkSolverNode : public VPxNode {
public:
  ~VPxIkSolverNode() override;

  VPxNode::Type type() const override;  // kIkSolverNode

  // One solve of the current handle group: preSolve, doSolve, then postSolve
  // with doSolve's status. doSolve is what a solver provides.
  virtual VStatus preSolve();
  virtual VStatus doSolve();
  virtual VStatus postSolve(VStatus stat);
  // The name under which the solver is listed; empty by default.
  virtual VString solverTypeName() const;

  // What the solver supports; the defaults answer what the setters below set
  // (all false, rotatePlane included, until set).
  virtual bool isSingleChainOnly() const;
  virtual bool isPositionOnly() const;
  virtual bool hasJointLimitSupport() const;
  virtual bool hasUniqueSolution() const;
  virtual bool rotatePlane() const;
  // True: handles with the same topology are solved together.
  virtual bool groupHandlesByTopology() const;
  // Moves the handle to the end of its chain.
  virtual void snapHandle(VObject &handle);
  virtual void setFuncValueTolerance(double tolerance);
  virtual void setMaxIterations(int value);
  // Whether the solver made the attribute itself; false by default.
  virtual bool isAttributeCreatedBySolver(const VObject &attr);

  void setRotatePlane(bool rotatePlane);
  void setSingleChainOnly(bool singleChainOnly);
  void setPositionOnly(bool positionOnly);
  void setSupportJointLimits(bool supportJointLimits);
  void setUniqueSolution(bool uniqueSolution);
  // 1e-5 and 100 until set.
  double funcValueTolerance() const;
  int maxIterations() const;

  // The handles being solved; null outside a solve.
  VIkHandleGroup *handleGroup() const;
  void setHandleGroup(VIkHandleGroup *group);
  // The handle solved now; the null object outside a solve.
  VObject currentHandle() const;
  VStatus setCurrentHandle(VObject &handle);

  // Between world space and the space of the current handle's chain; the
  // identity while no handle is set.
  void toWorldSpace(VPoint &point);
  void toWorldSpace(VVector &vector);
  void toSolverSpace(VPoint &point);
  void toSolverSpace(VVector &vector);

  // The angles of the chain's joints, three per joint.
  VStatus getJointAngles(VDoubleArray &angles) const;
  VStatus setJointAngles(const VDoubleArray &angles);
  unsigned int jointCount() const;
  // One angle; kInvalidParameter (and 0) past the last.
  double jointAngle(unsigned int index) const;
  VStatus setJointAngle(unsigned int index, double angle);
  // Sets every angle back to 0, the chain's rest pose.
  void setToRestAngles();
  static const char *className();

protected:
  VPxIkSolverNode();

private:
  bool fRotatePlane;
  bool fSingleChainOnly;
  bool fPositionOnly;
  bool fSupportJointLimits;
  bool fUniqueSolution;
  double fFuncValueTolerance;
  int fMaxIterations;
  VIkHandleGroup *fHandleGroup;
  VObject fCurrentHandle;
  VDoubleArray fJointAngles;
};

OPENVORLA_NAMESPACE_CLOSE
