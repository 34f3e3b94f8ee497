// VPxFluidEmitterNode: construction and the static attribute objects.
#include <openvorla/VPxFluidEmitterNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxFluidEmitterNode::VPxFluidEmitterNode() { standin::noteConstructed("VPxFluidEmitterNode"); }
VPxFluidEmitterNode::~VPxFluidEmitterNode() { standin::noteDestroyed("VPxFluidEmitterNode"); }

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
