// Base class of plug-in hardware shader nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxHwShaderNode : public VPxNode {
public:
  enum WriteMask {
    kWriteNone = 0,
    kWriteVertexArray = 1,
    kWriteNormalArray = 2,
    kWriteColorArrays = 4,
    kWriteTexCoordArrays = 8,
    kWriteAll = 15
  };

  enum DirtyMask {
    kDirtyNone = 0,
    kDirtyVertexArray = 1,
    kDirtyNormalArray = 2,
    kDirtyColorArrays = 4,
    kDirtyTexCoordArrays = 8,
    kDirtyAll = 15
  };

  enum TransparencyOptions {
    kIsTransparent = 1,
    kNoTransparencyFrontBackCull = 2,
    kNoTransparencyPolygonSort = 4
  };

  VPxHwShaderNode();
  ~VPxHwShaderNode() override;

  static VObject outColor;
  static VObject outColorR;
  static VObject outColorG;
  static VObject outColorB;
  static VObject outTransparency;
  static VObject outTransparencyR;
  static VObject outTransparencyG;
  static VObject outTransparencyB;
  static VObject outMatteOpacity;
  static VObject outMatteOpacityR;
  static VObject outMatteOpacityG;
  static VObject outMatteOpacityB;
  static VObject outGlowColor;
  static VObject outGlowColorR;
  static VObject outGlowColorG;
  static VObject outGlowColorB;
};

OPENVORLA_NAMESPACE_CLOSE
