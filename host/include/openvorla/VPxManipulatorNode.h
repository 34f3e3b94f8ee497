// Base class of plug-in manipulator nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxManipulatorNode : public VPxNode {
public:
  VPxManipulatorNode();
  ~VPxManipulatorNode() override;

  static VObject connectedNodes;
};

OPENVORLA_NAMESPACE_CLOSE
