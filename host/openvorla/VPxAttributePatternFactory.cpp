// VPxAttributePatternFactory: construction and destruction.
#include <openvorla/VPxAttributePatternFactory.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxAttributePatternFactory::VPxAttributePatternFactory() {
  standin::noteConstructed("VPxAttributePatternFactory");
}
VPxAttributePatternFactory::~VPxAttributePatternFactory() {
  standin::noteDestroyed("VPxAttributePatternFactory");
}

OPENVORLA_NAMESPACE_CLOSE
