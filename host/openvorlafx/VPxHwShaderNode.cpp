// VPxHwShaderNode: construction and the static attribute objects.
#include <openvorla/VPxHwShaderNode.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxHwShaderNode::VPxHwShaderNode() { standin::noteConstructed("VPxHwShaderNode"); }
VPxHwShaderNode::~VPxHwShaderNode() { standin::noteDestroyed("VPxHwShaderNode"); }

VPxNode::Type VPxHwShaderNode::type() const { return kHwShaderNode; }
VStatus VPxHwShaderNode::bind(const VDagPath &) { return VStatus::kNotImplemented; }
VStatus VPxHwShaderNode::unbind(const VDagPath &) { return VStatus::kNotImplemented; }

VStatus VPxHwShaderNode::geometry(const VDagPath &, int, unsigned int, int, const unsigned int *,
                                  int, const int *, const float *) {
  return VStatus::kNotImplemented;
}

VStatus VPxHwShaderNode::geometry(const VDagPath &, int, unsigned int, int, const unsigned int *,
                                  int, const int *, const float *, int, const float *, int,
                                  const float *, int, const float *) {
  return VStatus::kNotImplemented;
}

VStatus VPxHwShaderNode::glBind(const VDagPath &) { return VStatus::kNotImplemented; }
VStatus VPxHwShaderNode::glUnbind(const VDagPath &) { return VStatus::kNotImplemented; }

VStatus VPxHwShaderNode::glGeometry(const VDagPath &, int, unsigned int, int, const unsigned int *,
                                    int, const int *, const float *) {
  return VStatus::kNotImplemented;
}

VStatus VPxHwShaderNode::glGeometry(const VDagPath &, int, unsigned int, int, const unsigned int *,
                                    int, const int *, const float *, int, const float *, int,
                                    const float *, int, const float *) {
  return VStatus::kNotImplemented;
}

bool VPxHwShaderNode::supportsBatching() const { return false; }
bool VPxHwShaderNode::invertTexCoords() const { return false; }
int VPxHwShaderNode::normalsPerVertex() { return 1; }
int VPxHwShaderNode::colorsPerVertex() { return 0; }
int VPxHwShaderNode::texCoordsPerVertex() { return 0; }
int VPxHwShaderNode::getColorSetNames(VStringArray &) { return 0; }
int VPxHwShaderNode::getTexCoordSetNames(VStringArray &) { return 0; }
bool VPxHwShaderNode::provideVertexIDs() { return false; }
bool VPxHwShaderNode::provideFaceIDs() { return false; }
bool VPxHwShaderNode::hasTransparency() { return false; }
unsigned int VPxHwShaderNode::transparencyOptions() { return 0; }

// The stand-in draws nothing: every array is always to be sent, and no shape
// is being drawn.
unsigned int VPxHwShaderNode::dirtyMask() const { return kDirtyAll; }
VDagPath VPxHwShaderNode::currentPath() const { return VDagPath(); }
VObject VPxHwShaderNode::currentShadingEngine() const { return VObject(); }
VPxHwShaderNode *VPxHwShaderNode::getHwShaderNodePtr(VObject &) { return nullptr; }
const char *VPxHwShaderNode::className() { return "VPxHwShaderNode"; }

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
