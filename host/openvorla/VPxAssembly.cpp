// VPxAssembly: the host's default assembly behaviour, activation and edits.
#include <openvorla/VPxAssembly.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

// Clears the flag however activate() leaves.
class Activating {
 public:
  explicit Activating(bool &flag) : fFlag(flag) { fFlag = true; }
  ~Activating() { fFlag = false; }

 private:
  bool &fFlag;
};

bool listed(const VStringArray &names, const VString &name) {
  for (unsigned int i = 0; i < names.length(); ++i)
    if (names[i] == name) return true;
  return false;
}

}  // namespace

VPxAssembly::VPxAssembly() : fActivating(false) { standin::noteConstructed("VPxAssembly"); }
VPxAssembly::~VPxAssembly() { standin::noteDestroyed("VPxAssembly"); }

VPxNode::Type VPxAssembly::type() const { return kAssembly; }

void VPxAssembly::postConstructor() {
  VPxNode::postConstructor();
  bool hasInitialRep = false;
  VString initial = getInitialRep(hasInitialRep);
  if (hasInitialRep) activate(initial);
}

unsigned int VPxAssembly::repCount() const { return getRepresentations().length(); }
VString VPxAssembly::getInitialRep() const { return VString(); }

VString VPxAssembly::getInitialRep(bool &hasInitialRep) const {
  VString initial = getInitialRep();
  hasInitialRep = initial.numChars() > 0;
  return initial;
}

bool VPxAssembly::inactivateRep() { return true; }
void VPxAssembly::preActivateRep(const VString &) {}
void VPxAssembly::postActivateRep(const VString &) {}
bool VPxAssembly::canRenameRepresentation(const VString &) const { return true; }
bool VPxAssembly::canDeleteRepresentation(const VString &) const { return true; }
VString VPxAssembly::getRepNamespace() const { return VString(); }
void VPxAssembly::updateRepNamespace(const VString &) {}
bool VPxAssembly::supportsEdits() const { return false; }
bool VPxAssembly::canRepApplyEdits(const VString &) const { return false; }
bool VPxAssembly::handlesAddEdits() const { return false; }
bool VPxAssembly::handlesRemoveEdits() const { return false; }
void VPxAssembly::preApplyEdits() {}
void VPxAssembly::postApplyEdits() {}
bool VPxAssembly::supportsMemberChanges() const { return false; }
void VPxAssembly::memberAdded(VObject &) {}
void VPxAssembly::memberRemoved(VObject &) {}
void VPxAssembly::beforeSave() {}
void VPxAssembly::postLoad() {}

VStatus VPxAssembly::activate(const VString &representation) {
  if (!listed(getRepresentations(), representation))
    return VStatus(VStatus::kInvalidParameter, "The assembly has no such representation");
  Activating activating(fActivating);
  preActivateRep(representation);
  if (!inactivateRep())
    return VStatus(VStatus::kFailure, "The active representation could not be inactivated");
  bool activated = activateRep(representation);
  postActivateRep(representation);
  if (!activated) return VStatus(VStatus::kFailure, "The representation could not be activated");
  return VStatus::kSuccess;
}

bool VPxAssembly::isActivating() const { return fActivating; }

// The stand-in's scene has no nested assemblies.
bool VPxAssembly::isTopLevel() const { return true; }

VStatus VPxAssembly::addEdit(const VString &command) {
  if (command.numChars() == 0) return VStatus(VStatus::kInvalidParameter, "Empty edit");
  return fEdits.append(command);
}

VStatus VPxAssembly::removeEdit(unsigned int index) {
  if (index >= fEdits.length()) return VStatus(VStatus::kInvalidParameter, "No such edit");
  VStringArray kept;
  for (unsigned int i = 0; i < fEdits.length(); ++i)
    if (i != index) kept.append(fEdits[i]);
  fEdits = kept;
  return VStatus::kSuccess;
}

VStatus VPxAssembly::clearEdits() { return fEdits.clear(); }
VStringArray VPxAssembly::edits() const { return fEdits; }
unsigned int VPxAssembly::editCount() const { return fEdits.length(); }
bool VPxAssembly::hasEdits() const { return fEdits.length() > 0; }
const char *VPxAssembly::className() { return "VPxAssembly"; }

// The stand-in draws no views and has no outliner to refresh.
void VPxAssembly::notifyRepChanged() {}

OPENVORLA_NAMESPACE_CLOSE
