// Base class of plug-in emitters that emit into fluids.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VColor.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxEmitterNode.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxFluidEmitterNode : public VPxEmitterNode {
public:
  VPxFluidEmitterNode();
  ~VPxFluidEmitterNode() override;

  VPxNode::Type type() const override;  // kFluidEmitterNode

  // Emits into the fluid object placed by worldMatrix, for output
  // plugIndex. kNotImplemented: the host emits by the emitter's attributes.
  virtual VStatus fluidEmitter(const VObject &fluidObject, const VMatrix &worldMatrix,
                               int plugIndex);

  // The emitter's fluid attribute values in the block.
  double fluidDensityEmission(VDataBlock &block);
  double fluidHeatEmission(VDataBlock &block);
  double fluidFuelEmission(VDataBlock &block);
  bool fluidEmitColor(VDataBlock &block);
  VColor fluidColor(VDataBlock &block);
  double fluidDropoff(VDataBlock &block);
  double turbulence(VDataBlock &block);
  double fluidJitter(VDataBlock &block);
  // Whether an emission function is connected to mEmissionFunction.
  bool hasEmissionFunction(VDataBlock &block);
  static const char *className();

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
