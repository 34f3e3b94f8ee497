// Base class of the commands that create and edit plug-in constraints.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxCommand.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxConstraintCommand : public VPxCommand {
public:
  enum TargetType {
    kTransform,
    kGeometryShape,
    kLast
  };

  VPxConstraintCommand();
  ~VPxConstraintCommand() override;
};

OPENVORLA_NAMESPACE_CLOSE
