// VPxAttributePatternFactory: construction, destruction and the class name.
#include <openvorla/VPxAttributePatternFactory.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxAttributePatternFactory::VPxAttributePatternFactory() {
  standin::noteConstructed("VPxAttributePatternFactory");
}
VPxAttributePatternFactory::~VPxAttributePatternFactory() {
  standin::noteDestroyed("VPxAttributePatternFactory");
}

const char *VPxAttributePatternFactory::className() { return "VPxAttributePatternFactory"; }

OPENVORLA_NAMESPACE_CLOSE
