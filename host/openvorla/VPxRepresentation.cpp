// VPxRepresentation: the host's defaults and the representation's name.
#include <openvorla/VPxRepresentation.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxRepresentation::VPxRepresentation(VPxAssembly *assembly, const VString &name)
    : fAssembly(assembly), fName(name) {
  standin::noteConstructed("VPxRepresentation");
}

VPxRepresentation::~VPxRepresentation() { standin::noteDestroyed("VPxRepresentation"); }

bool VPxRepresentation::inactivate() { return true; }
bool VPxRepresentation::canApplyEdits() const { return false; }
void VPxRepresentation::getExternalContent(VExternalContentInfoTable &) const {}
void VPxRepresentation::setExternalContent(const VExternalContentLocationTable &) {}
VString VPxRepresentation::getName() const { return fName; }
const char *VPxRepresentation::className() { return "VPxRepresentation"; }

OPENVORLA_NAMESPACE_CLOSE
