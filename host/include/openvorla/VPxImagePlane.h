// Base class of plug-in image planes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxImagePlane : public VPxNode {
public:
  VPxImagePlane();
  ~VPxImagePlane() override;

  static VObject imageType;
  static VObject imageName;
  static VObject useFrameExtension;
  static VObject frameExtension;
  static VObject frameOffset;
  static VObject coverage;
  static VObject coverageX;
  static VObject coverageY;
  static VObject coverageOrigin;
  static VObject coverageOriginX;
  static VObject coverageOriginY;
  static VObject sourceTexture;
  static VObject fit;
  static VObject displayMode;
  static VObject displayOnlyIfCurrent;
  static VObject colorGain;
  static VObject colorGainR;
  static VObject colorGainG;
  static VObject colorGainB;
  static VObject colorOffset;
  static VObject colorOffsetR;
  static VObject colorOffsetG;
  static VObject colorOffsetB;
  static VObject alphaGain;
  static VObject shadingSamplesOverride;
  static VObject shadingSamples;
  static VObject maxShadingSamples;
  static VObject lockedToCamera;
  static VObject depth;
  static VObject squeezeCorrection;
  static VObject size;
  static VObject sizeX;
  static VObject sizeY;
  static VObject offset;
  static VObject offsetX;
  static VObject offsetY;
  static VObject center;
  static VObject centerX;
  static VObject centerY;
  static VObject centerZ;
  static VObject width;
  static VObject height;
  static VObject visibleInReflections;
  static VObject visibleInRefractions;
  static VObject rotate;
  static VObject alreadyPremult;
  static VObject useDepthMap;
  static VObject composite;
  static VObject depthOversample;
  static VObject separateDepth;
  static VObject depthFile;
  static VObject depthBias;
  static VObject depthScale;
};

OPENVORLA_NAMESPACE_CLOSE
