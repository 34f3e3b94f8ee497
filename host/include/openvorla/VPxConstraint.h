// Base class of plug-in constraint nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxConstraint : public VPxNode {
public:
  enum WorldUpType {
    kScene,
    kObject,
    kObjectRotation,
    kVector,
    kLast
  };

  VPxConstraint();
  ~VPxConstraint() override;

  static VObject enableRestPosition;
  static VObject lockOutput;
};

OPENVORLA_NAMESPACE_CLOSE
