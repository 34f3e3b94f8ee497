// VPxFluidEmitterNode: construction and the static attribute objects.
#include <openvorla/VPxFluidEmitterNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxFluidEmitterNode::VPxFluidEmitterNode() { standin::noteConstructed("VPxFluidEmitterNode"); }
VPxFluidEmitterNode::~VPxFluidEmitterNode() { standin::noteDestroyed("VPxFluidEmitterNode"); }

VPxNode::Type VPxFluidEmitterNode::type() const { return kFluidEmitterNode; }

VStatus VPxFluidEmitterNode::fluidEmitter(const VObject &, const VMatrix &, int) {
  return VStatus::kNotImplemented;
}

double VPxFluidEmitterNode::fluidDensityEmission(VDataBlock &block) {
  return block.inputValue(mFluidDensityEmission).asDouble();
}

double VPxFluidEmitterNode::fluidHeatEmission(VDataBlock &block) {
  return block.inputValue(mFluidHeatEmission).asDouble();
}

double VPxFluidEmitterNode::fluidFuelEmission(VDataBlock &block) {
  return block.inputValue(mFluidFuelEmission).asDouble();
}

bool VPxFluidEmitterNode::fluidEmitColor(VDataBlock &block) {
  return block.inputValue(mEmitFluidColor).asBool();
}

VColor VPxFluidEmitterNode::fluidColor(VDataBlock &block) {
  return VColor(block.inputValue(mFluidColorR).asFloat(), block.inputValue(mFluidColorG).asFloat(),
                block.inputValue(mFluidColorB).asFloat());
}

double VPxFluidEmitterNode::fluidDropoff(VDataBlock &block) {
  return block.inputValue(mFluidDropoff).asDouble();
}

double VPxFluidEmitterNode::turbulence(VDataBlock &block) {
  return block.inputValue(mTurbulence).asDouble();
}

double VPxFluidEmitterNode::fluidJitter(VDataBlock &block) {
  return block.inputValue(mFluidJitter).asDouble();
}

// The stand-in's blocks hold numbers and strings: no function is ever connected.
bool VPxFluidEmitterNode::hasEmissionFunction(VDataBlock &) { return false; }
const char *VPxFluidEmitterNode::className() { return "VPxFluidEmitterNode"; }

VObject VPxFluidEmitterNode::mFluidDensityEmission =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidDensityEmission");
VObject VPxFluidEmitterNode::mFluidHeatEmission =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidHeatEmission");
VObject VPxFluidEmitterNode::mFluidFuelEmission =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidFuelEmission");
VObject VPxFluidEmitterNode::mEmitFluidColor =
    standin::makeAttribute("VPxFluidEmitterNode.mEmitFluidColor");
VObject VPxFluidEmitterNode::mFluidColor =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidColor");
VObject VPxFluidEmitterNode::mFluidColorR =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidColorR");
VObject VPxFluidEmitterNode::mFluidColorG =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidColorG");
VObject VPxFluidEmitterNode::mFluidColorB =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidColorB");
VObject VPxFluidEmitterNode::mFluidDropoff =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidDropoff");
VObject VPxFluidEmitterNode::mTurbulence =
    standin::makeAttribute("VPxFluidEmitterNode.mTurbulence");
VObject VPxFluidEmitterNode::mFluidJitter =
    standin::makeAttribute("VPxFluidEmitterNode.mFluidJitter");
VObject VPxFluidEmitterNode::mEmissionFunction =
    standin::makeAttribute("VPxFluidEmitterNode.mEmissionFunction");

OPENVORLA_NAMESPACE_CLOSE
