// VPxObjectSet: construction and the static attribute objects.
#include <openvorla/VPxObjectSet.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

VPxObjectSet::VPxObjectSet() { standin::noteConstructed("VPxObjectSet"); }
VPxObjectSet::~VPxObjectSet() { standin::noteDestroyed("VPxObjectSet"); }

VPxNode::Type VPxObjectSet::type() const { return kObjectSet; }
bool VPxObjectSet::canBeDeleted(bool) { return true; }
const char *VPxObjectSet::className() { return "VPxObjectSet"; }

VObject VPxObjectSet::dagSetMembers = standin::makeAttribute("VPxObjectSet.dagSetMembers");
VObject VPxObjectSet::DNSetMembers = standin::makeAttribute("VPxObjectSet.DNSetMembers");
VObject VPxObjectSet::memberWireframeColor =
    standin::makeAttribute("VPxObjectSet.memberWireframeColor");
VObject VPxObjectSet::annotation = standin::makeAttribute("VPxObjectSet.annotation");
VObject VPxObjectSet::isLayer = standin::makeAttribute("VPxObjectSet.isLayer");
VObject VPxObjectSet::verticesOnlySet = standin::makeAttribute("VPxObjectSet.verticesOnlySet");
VObject VPxObjectSet::edgesOnlySet = standin::makeAttribute("VPxObjectSet.edgesOnlySet");
VObject VPxObjectSet::facetsOnlySet = standin::makeAttribute("VPxObjectSet.facetsOnlySet");
VObject VPxObjectSet::editPointsOnlySet = standin::makeAttribute("VPxObjectSet.editPointsOnlySet");
VObject VPxObjectSet::renderableOnlySet = standin::makeAttribute("VPxObjectSet.renderableOnlySet");
VObject VPxObjectSet::partition = standin::makeAttribute("VPxObjectSet.partition");
VObject VPxObjectSet::groupNodes = standin::makeAttribute("VPxObjectSet.groupNodes");
VObject VPxObjectSet::usedByNodes = standin::makeAttribute("VPxObjectSet.usedByNodes");

OPENVORLA_NAMESPACE_CLOSE
