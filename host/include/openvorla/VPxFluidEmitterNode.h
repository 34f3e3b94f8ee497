// Base class of plug-in emitters that emit into fluids.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxEmitterNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxFluidEmitterNode : public VPxEmitterNode {
public:
  VPxFluidEmitterNode();
  ~VPxFluidEmitterNode() override;

  static VObject mFluidDensityEmission;
  static VObject mFluidHeatEmission;
  static VObject mFluidFuelEmission;
  static VObject mEmitFluidColor;
  static VObject mFluidColor;
  static VObject mFluidColorR;
  static VObject mFluidColorG;
  static VObject mFluidColorB;
  static VObject mFluidDropoff;
  static VObject mTurbulence;
  static VObject mFluidJitter;
  static VObject mEmissionFunction;
};

OPENVORLA_NAMESPACE_CLOSE
