// VPxImagePlane: construction and the static attribute objects.
#include <openvorla/VPxImagePlane.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxImagePlane::VPxImagePlane() { standin::noteConstructed("VPxImagePlane"); }
VPxImagePlane::~VPxImagePlane() { standin::noteDestroyed("VPxImagePlane"); }

VPxNode::Type VPxImagePlane::type() const { return kImagePlaneNode; }

VStatus VPxImagePlane::loadImageMap(const VString &, int, VImage &) {
  return VStatus::kNotImplemented;
}

// The stand-in draws no image planes: there is nothing to load again.
VStatus VPxImagePlane::setImageDirty() { return VStatus::kSuccess; }
VStatus VPxImagePlane::refreshImage() { return VStatus::kSuccess; }
VString VPxImagePlane::exactImageFile() const { return VString(); }
const char *VPxImagePlane::className() { return "VPxImagePlane"; }

VObject VPxImagePlane::imageType = standin::makeAttribute("VPxImagePlane.imageType");
VObject VPxImagePlane::imageName = standin::makeAttribute("VPxImagePlane.imageName");
VObject VPxImagePlane::useFrameExtension =
    standin::makeAttribute("VPxImagePlane.useFrameExtension");
VObject VPxImagePlane::frameExtension = standin::makeAttribute("VPxImagePlane.frameExtension");
VObject VPxImagePlane::frameOffset = standin::makeAttribute("VPxImagePlane.frameOffset");
VObject VPxImagePlane::coverage = standin::makeAttribute("VPxImagePlane.coverage");
VObject VPxImagePlane::coverageX = standin::makeAttribute("VPxImagePlane.coverageX");
VObject VPxImagePlane::coverageY = standin::makeAttribute("VPxImagePlane.coverageY");
VObject VPxImagePlane::coverageOrigin = standin::makeAttribute("VPxImagePlane.coverageOrigin");
VObject VPxImagePlane::coverageOriginX = standin::makeAttribute("VPxImagePlane.coverageOriginX");
VObject VPxImagePlane::coverageOriginY = standin::makeAttribute("VPxImagePlane.coverageOriginY");
VObject VPxImagePlane::sourceTexture = standin::makeAttribute("VPxImagePlane.sourceTexture");
VObject VPxImagePlane::fit = standin::makeAttribute("VPxImagePlane.fit");
VObject VPxImagePlane::displayMode = standin::makeAttribute("VPxImagePlane.displayMode");
VObject VPxImagePlane::displayOnlyIfCurrent =
    standin::makeAttribute("VPxImagePlane.displayOnlyIfCurrent");
VObject VPxImagePlane::colorGain = standin::makeAttribute("VPxImagePlane.colorGain");
VObject VPxImagePlane::colorGainR = standin::makeAttribute("VPxImagePlane.colorGainR");
VObject VPxImagePlane::colorGainG = standin::makeAttribute("VPxImagePlane.colorGainG");
VObject VPxImagePlane::colorGainB = standin::makeAttribute("VPxImagePlane.colorGainB");
VObject VPxImagePlane::colorOffset = standin::makeAttribute("VPxImagePlane.colorOffset");
VObject VPxImagePlane::colorOffsetR = standin::makeAttribute("VPxImagePlane.colorOffsetR");
VObject VPxImagePlane::colorOffsetG = standin::makeAttribute("VPxImagePlane.colorOffsetG");
VObject VPxImagePlane::colorOffsetB = standin::makeAttribute("VPxImagePlane.colorOffsetB");
VObject VPxImagePlane::alphaGain = standin::makeAttribute("VPxImagePlane.alphaGain");
VObject VPxImagePlane::shadingSamplesOverride =
    standin::makeAttribute("VPxImagePlane.shadingSamplesOverride");
VObject VPxImagePlane::shadingSamples = standin::makeAttribute("VPxImagePlane.shadingSamples");
VObject VPxImagePlane::maxShadingSamples =
    standin::makeAttribute("VPxImagePlane.maxShadingSamples");
VObject VPxImagePlane::lockedToCamera = standin::makeAttribute("VPxImagePlane.lockedToCamera");
VObject VPxImagePlane::depth = standin::makeAttribute("VPxImagePlane.depth");
VObject VPxImagePlane::squeezeCorrection =
    standin::makeAttribute("VPxImagePlane.squeezeCorrection");
VObject VPxImagePlane::size = standin::makeAttribute("VPxImagePlane.size");
VObject VPxImagePlane::sizeX = standin::makeAttribute("VPxImagePlane.sizeX");
VObject VPxImagePlane::sizeY = standin::makeAttribute("VPxImagePlane.sizeY");
VObject VPxImagePlane::offset = standin::makeAttribute("VPxImagePlane.offset");
VObject VPxImagePlane::offsetX = standin::makeAttribute("VPxImagePlane.offsetX");
VObject VPxImagePlane::offsetY = standin::makeAttribute("VPxImagePlane.offsetY");
VObject VPxImagePlane::center = standin::makeAttribute("VPxImagePlane.center");
VObject VPxImagePlane::centerX = standin::makeAttribute("VPxImagePlane.centerX");
VObject VPxImagePlane::centerY = standin::makeAttribute("VPxImagePlane.centerY");
VObject VPxImagePlane::centerZ = standin::makeAttribute("VPxImagePlane.centerZ");
VObject VPxImagePlane::width = standin::makeAttribute("VPxImagePlane.width");
VObject VPxImagePlane::height = standin::makeAttribute("VPxImagePlane.height");
VObject VPxImagePlane::visibleInReflections =
    standin::makeAttribute("VPxImagePlane.visibleInReflections");
VObject VPxImagePlane::visibleInRefractions =
    standin::makeAttribute("VPxImagePlane.visibleInRefractions");
VObject VPxImagePlane::rotate = standin::makeAttribute("VPxImagePlane.rotate");
VObject VPxImagePlane::alreadyPremult = standin::makeAttribute("VPxImagePlane.alreadyPremult");
VObject VPxImagePlane::useDepthMap = standin::makeAttribute("VPxImagePlane.useDepthMap");
VObject VPxImagePlane::composite = standin::makeAttribute("VPxImagePlane.composite");
VObject VPxImagePlane::depthOversample = standin::makeAttribute("VPxImagePlane.depthOversample");
VObject VPxImagePlane::separateDepth = standin::makeAttribute("VPxImagePlane.separateDepth");
VObject VPxImagePlane::depthFile = standin::makeAttribute("VPxImagePlane.depthFile");
VObject VPxImagePlane::depthBias = standin::makeAttribute("VPxImagePlane.depthBias");
VObject VPxImagePlane::depthScale = standin::makeAttribute("VPxImagePlane.depthScale");

OPENVORLA_NAMESPACE_CLOSE
