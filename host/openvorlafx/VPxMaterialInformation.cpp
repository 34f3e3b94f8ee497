// VPxMaterialInformation: construction, destruction and the class name.
#include <openvorla/VPxMaterialInformation.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxMaterialInformation::VPxMaterialInformation(VObject &) {
  standin::noteConstructed("VPxMaterialInformation");
}
VPxMaterialInformation::VPxMaterialInformation(VObject &, const VObject &) {
  standin::noteConstructed("VPxMaterialInformation");
}
VPxMaterialInformation::~VPxMaterialInformation() {
  standin::noteDestroyed("VPxMaterialInformation");
}

const char *VPxMaterialInformation::className() { return "VPxMaterialInformation"; }

OPENVORLA_NAMESPACE_CLOSE
