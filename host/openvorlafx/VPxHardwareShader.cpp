// VPxHardwareShader: construction and the static attribute objects.
#include <openvorla/VPxHardwareShader.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxHardwareShader::VPxHardwareShader() { standin::noteConstructed("VPxHardwareShader"); }
VPxHardwareShader::~VPxHardwareShader() { standin::noteDestroyed("VPxHardwareShader"); }

VPxNode::Type VPxHardwareShader::type() const { return kHardwareShader; }
VStatus VPxHardwareShader::render(VGeometryList &) { return VStatus::kNotImplemented; }
VStatus VPxHardwareShader::renderSwatchImage(VImage &) { return VStatus::kNotImplemented; }
unsigned int VPxHardwareShader::transparencyOptions() { return 0; }

VStatus VPxHardwareShader::getAvailableImages(const VString &, VStringArray &) {
  return VStatus::kNotImplemented;
}

// The stand-in renders nothing, so it keeps no parameters and has no resources.
VStatus VPxHardwareShader::setUniformParameters(const VUniformParameterList &, bool) {
  return VStatus::kSuccess;
}

VStatus VPxHardwareShader::setVaryingParameters(const VVaryingParameterList &, bool) {
  return VStatus::kSuccess;
}

VString VPxHardwareShader::findResource(const VString &, const VString &) { return VString(); }
VPxHardwareShader *VPxHardwareShader::getHardwareShaderPtr(VObject &) { return nullptr; }
const char *VPxHardwareShader::className() { return "VPxHardwareShader"; }

VObject VPxHardwareShader::outColor = standin::makeAttribute("VPxHardwareShader.outColor");
VObject VPxHardwareShader::outColorR = standin::makeAttribute("VPxHardwareShader.outColorR");
VObject VPxHardwareShader::outColorG = standin::makeAttribute("VPxHardwareShader.outColorG");
VObject VPxHardwareShader::outColorB = standin::makeAttribute("VPxHardwareShader.outColorB");

OPENVORLA_NAMESPACE_CLOSE
