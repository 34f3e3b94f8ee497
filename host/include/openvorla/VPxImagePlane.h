// Base class of plug-in image planes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class VImage;

class OPENVORLA_EXPORT VPxImagePlane : public VPxNode {
public:
  VPxImagePlane();
  ~VPxImagePlane() override;

  VPxNode::Type type() const override;  // kImagePlaneNode

  // Loads the frame of the image file into image. kNotImplemented: the host
  // loads the file itself.
  virtual VStatus loadImageMap(const VString &fileName, int frame, VImage &image);
  // Marks the image as changed, so that the host loads it again when it
  // draws; refreshImage loads it at once.
  VStatus setImageDirty();
  VStatus refreshImage();
  // The file the plane shows at the current frame, frame extension applied;
  // empty while the node has no image name.
  VString exactImageFile() const;
  static const char *className();

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
