// VPxGeometryFilter: construction, the default accessory attribute and the
// static attribute objects.
#include <openvorla/VPxGeometryFilter.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxGeometryFilter::VPxGeometryFilter() { standin::noteConstructed("VPxGeometryFilter"); }
VPxGeometryFilter::~VPxGeometryFilter() { standin::noteDestroyed("VPxGeometryFilter"); }

// The filter's own null object, so that no caller can change another's.
VObject &VPxGeometryFilter::accessoryAttribute() const {
  fNoAccessory = VObject();
  return fNoAccessory;
}

VObject VPxGeometryFilter::input = standin::makeAttribute("VPxGeometryFilter.input");
VObject VPxGeometryFilter::inputGeom = standin::makeAttribute("VPxGeometryFilter.inputGeom");
VObject VPxGeometryFilter::groupId = standin::makeAttribute("VPxGeometryFilter.groupId");
VObject VPxGeometryFilter::componentTagExpression =
    standin::makeAttribute("VPxGeometryFilter.componentTagExpression");
VObject VPxGeometryFilter::outputGeom = standin::makeAttribute("VPxGeometryFilter.outputGeom");
VObject VPxGeometryFilter::envelope = standin::makeAttribute("VPxGeometryFilter.envelope");
VObject VPxGeometryFilter::originalGeometry =
    standin::makeAttribute("VPxGeometryFilter.originalGeometry");

OPENVORLA_NAMESPACE_CLOSE
