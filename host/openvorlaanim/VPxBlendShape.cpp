// VPxBlendShape: construction and the static attribute objects.
#include <openvorla/VPxBlendShape.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxBlendShape::VPxBlendShape() { standin::noteConstructed("VPxBlendShape"); }
VPxBlendShape::~VPxBlendShape() { standin::noteDestroyed("VPxBlendShape"); }

VPxNode::Type VPxBlendShape::type() const { return kBlendShape; }

VStatus VPxBlendShape::deformData(VDataBlock &, VDataHandle, unsigned int, const VMatrix &,
                                  unsigned int) {
  return VStatus::kNotImplemented;
}

const char *VPxBlendShape::className() { return "VPxBlendShape"; }

VObject VPxBlendShape::weight = standin::makeAttribute("VPxBlendShape.weight");
VObject VPxBlendShape::inputTarget = standin::makeAttribute("VPxBlendShape.inputTarget");
VObject VPxBlendShape::inputTargetGroup = standin::makeAttribute("VPxBlendShape.inputTargetGroup");
VObject VPxBlendShape::inputTargetItem = standin::makeAttribute("VPxBlendShape.inputTargetItem");
VObject VPxBlendShape::inputGeomTarget = standin::makeAttribute("VPxBlendShape.inputGeomTarget");
VObject VPxBlendShape::inputPointsTarget =
    standin::makeAttribute("VPxBlendShape.inputPointsTarget");
VObject VPxBlendShape::inputComponentsTarget =
    standin::makeAttribute("VPxBlendShape.inputComponentsTarget");
VObject VPxBlendShape::targetWeights = standin::makeAttribute("VPxBlendShape.targetWeights");

OPENVORLA_NAMESPACE_CLOSE
