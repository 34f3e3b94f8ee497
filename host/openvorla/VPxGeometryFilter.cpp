// VPxGeometryFilter: construction, the default accessory attribute and the
// static attribute objects.
#include <openvorla/VPxGeometryFilter.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include "BaseAttributes.h"

OPENVORLA_NAMESPACE_OPEN

VPxGeometryFilter::VPxGeometryFilter() : fDeformationDetails(0), fUseExistingConnection(true) {
  standin::noteConstructed("VPxGeometryFilter");
}

VPxGeometryFilter::~VPxGeometryFilter() { standin::noteDestroyed("VPxGeometryFilter"); }

// The filter's own null object, so that no caller can change another's.
VObject &VPxGeometryFilter::accessoryAttribute() const {
  fNoAccessory = VObject();
  return fNoAccessory;
}

VStatus VPxGeometryFilter::accessoryNodeSetup(VDagModifier &) { return VStatus::kSuccess; }

VStatus VPxGeometryFilter::deform(VDataBlock &, VItGeometry &, const VMatrix &, unsigned int) {
  return VStatus::kNotImplemented;
}

unsigned int VPxGeometryFilter::getDeformationDetails() const { return fDeformationDetails; }
VObject &VPxGeometryFilter::inputShapeAttribute() const { return inputGeom; }
VObject &VPxGeometryFilter::outputShapeAttribute() const { return outputGeom; }
VStatus VPxGeometryFilter::setModifiedCallback(VSelectionList &, bool) { return VStatus::kSuccess; }

VPxNode::Type VPxGeometryFilter::type() const { return kGeometryFilter; }

// kDeformsUVs and kDeformsColors are the only details there are.
VStatus VPxGeometryFilter::setDeformationDetails(unsigned int details) {
  if (details & ~static_cast<unsigned int>(kDeformsAll)) return VStatus::kInvalidParameter;
  fDeformationDetails = details;
  return VStatus::kSuccess;
}

// The stand-in's data blocks hold numbers and strings, never geometry.
VObject VPxGeometryFilter::getInputGeom(VDataBlock &, unsigned int) { return VObject(); }
VObject VPxGeometryFilter::getOutputGeom(VDataBlock &, unsigned int) { return VObject(); }

void VPxGeometryFilter::setUseExistingConnectionWhenSetEditing(bool state) {
  fUseExistingConnection = state;
}

const char *VPxGeometryFilter::className() { return "VPxGeometryFilter"; }

VObject VPxGeometryFilter::input = standin::makeAttribute("VPxGeometryFilter.input");
VObject VPxGeometryFilter::inputGeom = standin::bases::points("inputGeom", "ip", false);
VObject VPxGeometryFilter::groupId = standin::makeAttribute("VPxGeometryFilter.groupId");
VObject VPxGeometryFilter::componentTagExpression =
    standin::makeAttribute("VPxGeometryFilter.componentTagExpression");
VObject VPxGeometryFilter::outputGeom = standin::bases::points("outputGeom", "og", true);
VObject VPxGeometryFilter::envelope = standin::bases::number("envelope", "en", 1.0, 0.0, 1.0);
VObject VPxGeometryFilter::originalGeometry =
    standin::makeAttribute("VPxGeometryFilter.originalGeometry");

OPENVORLA_NAMESPACE_CLOSE
