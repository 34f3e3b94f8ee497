// Base class of plug-in camera sets.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxCameraSet : public VPxNode {
public:
  VPxCameraSet();
  ~VPxCameraSet() override;

  VPxNode::Type type() const override;  // kCameraSetNode
  static const char *className();

  static VObject cameraLayer;
  static VObject camera;
  static VObject sceneData;
  static VObject active;
  static VObject order;
};

OPENVORLA_NAMESPACE_CLOSE
