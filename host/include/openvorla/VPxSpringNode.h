// Base class of plug-in spring solvers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxSpringNode : public VPxNode {
public:
  VPxSpringNode();
  ~VPxSpringNode() override;

  static VObject mEnd1Weight;
  static VObject mEnd2Weight;
  static VObject mDeltaTime;
};

OPENVORLA_NAMESPACE_CLOSE
