// VPxContext: the host's default context behaviour, titles, icons and
// manipulators.
#include <openvorla/VPxContext.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

bool validImage(VPxContext::ImageIndex index) {
  return index >= VPxContext::kImage1 && index <= VPxContext::kImage3;
}

VStatus badImage() { return VStatus(VStatus::kInvalidParameter, "No such image index"); }

}  // namespace

VPxContext::VPxContext() { standin::noteConstructed("VPxContext"); }

VPxContext::VPxContext(const VString &titleString) : fTitle(titleString) {
  standin::noteConstructed("VPxContext");
}

VPxContext::~VPxContext() { standin::noteDestroyed("VPxContext"); }

void VPxContext::toolOnSetup(VEvent &) {}
void VPxContext::toolOffCleanup() {}
VStatus VPxContext::doPress(VEvent &) { return VStatus::kSuccess; }
VStatus VPxContext::doRelease(VEvent &) { return VStatus::kSuccess; }
VStatus VPxContext::doDrag(VEvent &) { return VStatus::kSuccess; }
VStatus VPxContext::doHold(VEvent &) { return VStatus::kSuccess; }
VStatus VPxContext::doPtrMoved(VEvent &) { return VStatus::kSuccess; }
VStatus VPxContext::doEnterRegion(VEvent &) { return VStatus::kSuccess; }
VStatus VPxContext::helpStateHasChanged(VEvent &) { return VStatus::kSuccess; }
void VPxContext::deleteAction() {}
void VPxContext::completeAction() {}
void VPxContext::abortAction() {}

VSyntax::VArgType VPxContext::argTypeNumericalInput(unsigned int) const { return VSyntax::kNoArg; }

bool VPxContext::processNumericalInput(const VDoubleArray &, const VIntArray &, bool) {
  return false;
}

bool VPxContext::feedbackNumericalInput() const { return false; }
VString VPxContext::stringClassName() const { return VString(); }
VPxToolCommand *VPxContext::newToolCommand() { return nullptr; }

VStatus VPxContext::setTitleString(const VString &title) {
  fTitle = title;
  return VStatus::kSuccess;
}

VString VPxContext::titleString() const { return fTitle; }

VStatus VPxContext::setHelpString(const VString &help) {
  fHelp = help;
  return VStatus::kSuccess;
}

VString VPxContext::helpString() const { return fHelp; }

VStatus VPxContext::setImage(const VString &image, ImageIndex index) {
  if (!validImage(index)) return badImage();
  fImages[index] = image;
  return VStatus::kSuccess;
}

VString VPxContext::image(ImageIndex index, VStatus *ReturnStatus) const {
  bool ok = validImage(index);
  if (ReturnStatus) *ReturnStatus = ok ? VStatus(VStatus::kSuccess) : badImage();
  return ok ? fImages[index] : VString();
}

bool VPxContext::ignoreEntry(const VIntArray &flags, unsigned int entry) const {
  return entry >= flags.length() || flags[entry] != 0;
}

VStatus VPxContext::addManipulator(const VObject &manipulator) {
  if (manipulator.isNull())
    return VStatus(VStatus::kInvalidParameter, "A manipulator cannot be the null object");
  fManipulators.push_back(manipulator);
  return VStatus::kSuccess;
}

VStatus VPxContext::deleteManipulators() {
  fManipulators.clear();
  return VStatus::kSuccess;
}

unsigned int VPxContext::manipulatorCount() const {
  return static_cast<unsigned int>(fManipulators.size());
}

const char *VPxContext::className() { return "VPxContext"; }

void VPxContext::selectionChanged() {}
VStatus VPxContext::drawFeedback(VHWRender::VUIDrawManager &) { return VStatus::kSuccess; }
VStatus VPxContext::updateManipulators(const VObject &) { return VStatus::kSuccess; }

// The stand-in has no views to show a cursor over.
VStatus VPxContext::setCursor(const VCursor &) { return VStatus::kSuccess; }

OPENVORLA_NAMESPACE_CLOSE
