// VPxSelectionContext: the selection in progress and the selection settings.
#include <openvorla/VPxSelectionContext.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus store(bool &slot, bool value) {
  slot = value;
  return VStatus::kSuccess;
}

}  // namespace

VPxSelectionContext::VPxSelectionContext()
    : fPreselectHilite(true),
      fSoftSelect(false),
      fSymmetry(false),
      fSnapping(true),
      fActivateSelectedObject(true),
      fDoubleClickAction(true),
      fPressed(false),
      fSelecting(false),
      fStartX(0),
      fStartY(0),
      fLastX(0),
      fLastY(0) {
  standin::noteConstructed("VPxSelectionContext");
}

VPxSelectionContext::~VPxSelectionContext() { standin::noteDestroyed("VPxSelectionContext"); }

VStatus VPxSelectionContext::doPress(VEvent &event) {
  event.getPosition(fStartX, fStartY);
  fLastX = fStartX;
  fLastY = fStartY;
  fPressed = fSelecting = true;
  return VStatus::kSuccess;
}

VStatus VPxSelectionContext::doRelease(VEvent &event) {
  if (fSelecting) event.getPosition(fLastX, fLastY);
  fSelecting = false;
  return VStatus::kSuccess;
}

VStatus VPxSelectionContext::doDrag(VEvent &event) {
  if (fSelecting) event.getPosition(fLastX, fLastY);
  return VStatus::kSuccess;
}

VStatus VPxSelectionContext::doHold(VEvent &) { return VStatus::kSuccess; }
VStatus VPxSelectionContext::doPtrMoved(VEvent &) { return VStatus::kSuccess; }
void VPxSelectionContext::abortAction() { fSelecting = false; }

void VPxSelectionContext::toolOffCleanup() {
  fSelecting = false;
  VPxContext::toolOffCleanup();
}

VStatus VPxSelectionContext::setAllowPreselectHilite(bool allow) {
  return store(fPreselectHilite, allow);
}
bool VPxSelectionContext::allowPreselectHilite() const { return fPreselectHilite; }
VStatus VPxSelectionContext::setAllowSoftSelect(bool allow) { return store(fSoftSelect, allow); }
bool VPxSelectionContext::allowSoftSelect() const { return fSoftSelect; }
VStatus VPxSelectionContext::setAllowSymmetry(bool allow) { return store(fSymmetry, allow); }
bool VPxSelectionContext::allowSymmetry() const { return fSymmetry; }
VStatus VPxSelectionContext::setAllowSnapping(bool allow) { return store(fSnapping, allow); }
bool VPxSelectionContext::allowSnapping() const { return fSnapping; }
VStatus VPxSelectionContext::setAllowActivateSelectedObject(bool allow) {
  return store(fActivateSelectedObject, allow);
}
bool VPxSelectionContext::allowActivateSelectedObject() const { return fActivateSelectedObject; }
VStatus VPxSelectionContext::setAllowDoubleClickAction(bool allow) {
  return store(fDoubleClickAction, allow);
}
bool VPxSelectionContext::allowDoubleClickAction() const { return fDoubleClickAction; }

bool VPxSelectionContext::isSelecting() const { return fSelecting; }

VStatus VPxSelectionContext::startPoint(short &x, short &y) const {
  if (!fPressed) return VStatus(VStatus::kFailure, "There was no press");
  x = fStartX;
  y = fStartY;
  return VStatus::kSuccess;
}

VStatus VPxSelectionContext::lastDragPoint(short &x, short &y) const {
  if (!fPressed) return VStatus(VStatus::kFailure, "There was no press");
  x = fLastX;
  y = fLastY;
  return VStatus::kSuccess;
}

const char *VPxSelectionContext::className() { return "VPxSelectionContext"; }

bool VPxSelectionContext::isMarquee() const {
  return fSelecting && (fLastX != fStartX || fLastY != fStartY);
}

OPENVORLA_NAMESPACE_CLOSE
