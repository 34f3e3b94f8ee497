// VPxCameraSet: construction and the static attribute objects.
#include <openvorla/VPxCameraSet.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxCameraSet::VPxCameraSet() { standin::noteConstructed("VPxCameraSet"); }
VPxCameraSet::~VPxCameraSet() { standin::noteDestroyed("VPxCameraSet"); }

VPxNode::Type VPxCameraSet::type() const { return kCameraSetNode; }
const char *VPxCameraSet::className() { return "VPxCameraSet"; }

VObject VPxCameraSet::cameraLayer = standin::makeAttribute("VPxCameraSet.cameraLayer");
VObject VPxCameraSet::camera = standin::makeAttribute("VPxCameraSet.camera");
VObject VPxCameraSet::sceneData = standin::makeAttribute("VPxCameraSet.sceneData");
VObject VPxCameraSet::active = standin::makeAttribute("VPxCameraSet.active");
VObject VPxCameraSet::order = standin::makeAttribute("VPxCameraSet.order");

OPENVORLA_NAMESPACE_CLOSE
