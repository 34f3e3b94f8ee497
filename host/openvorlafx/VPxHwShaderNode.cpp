// VPxHwShaderNode: construction and the static attribute objects.
#include <openvorla/VPxHwShaderNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxHwShaderNode::VPxHwShaderNode() { standin::noteConstructed("VPxHwShaderNode"); }
VPxHwShaderNode::~VPxHwShaderNode() { standin::noteDestroyed("VPxHwShaderNode"); }

VObject VPxHwShaderNode::outColor = standin::makeAttribute("VPxHwShaderNode.outColor");
VObject VPxHwShaderNode::outColorR = standin::makeAttribute("VPxHwShaderNode.outColorR");
VObject VPxHwShaderNode::outColorG = standin::makeAttribute("VPxHwShaderNode.outColorG");
VObject VPxHwShaderNode::outColorB = standin::makeAttribute("VPxHwShaderNode.outColorB");
VObject VPxHwShaderNode::outTransparency =
    standin::makeAttribute("VPxHwShaderNode.outTransparency");
VObject VPxHwShaderNode::outTransparencyR =
    standin::makeAttribute("VPxHwShaderNode.outTransparencyR");
VObject VPxHwShaderNode::outTransparencyG =
    standin::makeAttribute("VPxHwShaderNode.outTransparencyG");
VObject VPxHwShaderNode::outTransparencyB =
    standin::makeAttribute("VPxHwShaderNode.outTransparencyB");
VObject VPxHwShaderNode::outMatteOpacity =
    standin::makeAttribute("VPxHwShaderNode.outMatteOpacity");
VObject VPxHwShaderNode::outMatteOpacityR =
    standin::makeAttribute("VPxHwShaderNode.outMatteOpacityR");
VObject VPxHwShaderNode::outMatteOpacityG =
    standin::makeAttribute("VPxHwShaderNode.outMatteOpacityG");
VObject VPxHwShaderNode::outMatteOpacityB =
    standin::makeAttribute("VPxHwShaderNode.outMatteOpacityB");
VObject VPxHwShaderNode::outGlowColor = standin::makeAttribute("VPxHwShaderNode.outGlowColor");
VObject VPxHwShaderNode::outGlowColorR = standin::makeAttribute("VPxHwShaderNode.outGlowColorR");
VObject VPxHwShaderNode::outGlowColorG = standin::makeAttribute("VPxHwShaderNode.outGlowColorG");
VObject VPxHwShaderNode::outGlowColorB = standin::makeAttribute("VPxHwShaderNode.outGlowColorB");

OPENVORLA_NAMESPACE_CLOSE
