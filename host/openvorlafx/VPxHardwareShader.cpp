// VPxHardwareShader: construction and the static attribute objects.
#include <openvorla/VPxHardwareShader.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxHardwareShader::VPxHardwareShader() { standin::noteConstructed("VPxHardwareShader"); }
VPxHardwareShader::~VPxHardwareShader() { standin::noteDestroyed("VPxHardwareShader"); }

VObject VPxHardwareShader::outColor = standin::makeAttribute("VPxHardwareShader.outColor");
VObject VPxHardwareShader::outColorR = standin::makeAttribute("VPxHardwareShader.outColorR");
VObject VPxHardwareShader::outColorG = standin::makeAttribute("VPxHardwareShader.outColorG");
VObject VPxHardwareShader::outColorB = standin::makeAttribute("VPxHardwareShader.outColorB");

OPENVORLA_NAMESPACE_CLOSE
