// Base class of plug-in descriptions of a material for the viewport.
#pragma once

#include <openvorla/MaterialInputData.h>
#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxMaterialInformation {
public:
  enum MaterialType {
    kSimpleMaterial,
    kTexture,
    kOverrideDraw
  };

  VPxMaterialInformation(VObject &materialNode);
  VPxMaterialInformation(VObject &materialNode, const VObject &shadingEngine);
  virtual ~VPxMaterialInformation();

  virtual bool computeMaterial(MaterialInputData &data) = 0;
  virtual bool connectAsTexture(int channel, VPlug &texturePlug) = 0;
  virtual bool materialInfoIsDirty(const VPlug &plug) = 0;
  virtual void textureDisconnected(int channel) = 0;

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
