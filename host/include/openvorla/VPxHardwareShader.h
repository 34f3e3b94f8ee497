// Base class of plug-in hardware shaders.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxHardwareShader : public VPxNode {
public:
  enum TransparencyOptions {
    kIsTransparent = 1,
    kNoTransparencyFrontBackCull = 2,
    kNoTransparencyPolygonSort = 4
  };

  VPxHardwareShader();
  ~VPxHardwareShader() override;

  static VObject outColor;
  static VObject outColorR;
  static VObject outColorG;
  static VObject outColorB;
};

OPENVORLA_NAMESPACE_CLOSE
