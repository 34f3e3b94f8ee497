// Base class of plug-in hardware shaders.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>

OPENVORLA_NAMESPACE_OPEN

class VGeometryList;
class VImage;
class VUniformParameterList;
class VVaryingParameterList;

class OPENVORLA_EXPORT VPxHardwareShader : public VPxNode {
public:
  enum TransparencyOptions {
    kIsTransparent = 1,
    kNoTransparencyFrontBackCull = 2,
    kNoTransparencyPolygonSort = 4
  };

  VPxHardwareShader();
  ~VPxHardwareShader() override;

  VPxNode::Type type() const override;  // kHardwareShader

  // Draws the geometry of the list with the shader; kNotImplemented: the
  // host draws it unshaded.
  virtual VStatus render(VGeometryList &iterator);
  // Draws the shader's swatch into image; kNotImplemented: the host draws a
  // plain one.
  virtual VStatus renderSwatchImage(VImage &image);
  virtual unsigned int transparencyOptions();  // TransparencyOptions flags; 0
  // The images the shader can show for the uv set, for the texture editor.
  virtual VStatus getAvailableImages(const VString &uvSetName, VStringArray &imageNames);

  // The shader's parameters, declared from its initializer or its
  // attribute changes; remapCurrentValues keeps the values of parameters of
  // the same name.
  VStatus setUniformParameters(const VUniformParameterList &parameters,
                               bool remapCurrentValues = true);
  VStatus setVaryingParameters(const VVaryingParameterList &parameters,
                               bool remapCurrentValues = true);
  // The file of the resource name, looked up beside shaderPath and in the
  // host's resource paths; empty when there is none.
  VString findResource(const VString &name, const VString &shaderPath);
  // The plug-in node behind a hardware shader object; null for other objects.
  static VPxHardwareShader *getHardwareShaderPtr(VObject &object);
  static const char *className();

  static VObject outColor;
  static VObject outColorR;
  static VObject outColorG;
  static VObject outColorB;
};

OPENVORLA_NAMESPACE_CLOSE
