// Base class of plug-in inverse-kinematics solvers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxIkSolverNode : public VPxNode {
public:
  ~VPxIkSolverNode() override;

protected:
  VPxIkSolverNode();
};

OPENVORLA_NAMESPACE_CLOSE
