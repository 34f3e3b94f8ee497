// VPxParticleAttributeMapperNode: construction and the static attribute objects.
#include <openvorla/VPxParticleAttributeMapperNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxParticleAttributeMapperNode::VPxParticleAttributeMapperNode() {
  standin::noteConstructed("VPxParticleAttributeMapperNode");
}
VPxParticleAttributeMapperNode::~VPxParticleAttributeMapperNode() {
  standin::noteDestroyed("VPxParticleAttributeMapperNode");
}

VPxNode::Type VPxParticleAttributeMapperNode::type() const { return kParticleAttributeMapperNode; }

VStatus VPxParticleAttributeMapperNode::compute(const VPlug &plug, VDataBlock &dataBlock) {
  if (plug.attribute() != outValuePP) return VStatus::kUnknownParameter;
  double u = dataBlock.inputValue(uCoordPP).asDouble();
  double low = dataBlock.inputValue(outMinValue).asDouble();
  double high = dataBlock.inputValue(outMaxValue).asDouble();
  VDataHandle out = dataBlock.outputValue(outValuePP);
  out.setDouble(low + u * (high - low));
  out.setClean();
  return VStatus::kSuccess;
}

const char *VPxParticleAttributeMapperNode::className() { return "VPxParticleAttributeMapperNode"; }

VObject VPxParticleAttributeMapperNode::computeNode =
    standin::makeAttribute("VPxParticleAttributeMapperNode.computeNode");
VObject VPxParticleAttributeMapperNode::uCoordPP =
    standin::makeAttribute("VPxParticleAttributeMapperNode.uCoordPP");
VObject VPxParticleAttributeMapperNode::vCoordPP =
    standin::makeAttribute("VPxParticleAttributeMapperNode.vCoordPP");
VObject VPxParticleAttributeMapperNode::outMinValue =
    standin::makeAttribute("VPxParticleAttributeMapperNode.outMinValue");
VObject VPxParticleAttributeMapperNode::outMaxValue =
    standin::makeAttribute("VPxParticleAttributeMapperNode.outMaxValue");
VObject VPxParticleAttributeMapperNode::computeNodeColor =
    standin::makeAttribute("VPxParticleAttributeMapperNode.computeNodeColor");
VObject VPxParticleAttributeMapperNode::computeNodeColorR =
    standin::makeAttribute("VPxParticleAttributeMapperNode.computeNodeColorR");
VObject VPxParticleAttributeMapperNode::computeNodeColorG =
    standin::makeAttribute("VPxParticleAttributeMapperNode.computeNodeColorG");
VObject VPxParticleAttributeMapperNode::computeNodeColorB =
    standin::makeAttribute("VPxParticleAttributeMapperNode.computeNodeColorB");
VObject VPxParticleAttributeMapperNode::time =
    standin::makeAttribute("VPxParticleAttributeMapperNode.time");
VObject VPxParticleAttributeMapperNode::outColorPP =
    standin::makeAttribute("VPxParticleAttributeMapperNode.outColorPP");
VObject VPxParticleAttributeMapperNode::outValuePP =
    standin::makeAttribute("VPxParticleAttributeMapperNode.outValuePP");

OPENVORLA_NAMESPACE_CLOSE
