// VEvent: pointer events.
#include <openvorla/VEvent.h>

OPENVORLA_NAMESPACE_OPEN

VEvent::VEvent() : fX(0), fY(0), fButton(kLeftMouse), fModifiers(kNoModifier) {}

VEvent::VEvent(short x, short y, MouseButtonType button, unsigned int modifiers)
    : fX(x), fY(y), fButton(kLeftMouse), fModifiers(modifiers) {
  setMouseButton(button);
}

VEvent::VEvent(const VEvent &other) = default;
VEvent::~VEvent() = default;
VEvent &VEvent::operator=(const VEvent &other) = default;

VStatus VEvent::getPosition(short &x, short &y) const {
  x = fX;
  y = fY;
  return VStatus::kSuccess;
}

VStatus VEvent::setPosition(short x, short y) {
  fX = x;
  fY = y;
  return VStatus::kSuccess;
}

VEvent::MouseButtonType VEvent::mouseButton(VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return fButton;
}

VStatus VEvent::setMouseButton(MouseButtonType button) {
  if (button != kLeftMouse && button != kMiddleMouse && button != kRightMouse)
    return VStatus(VStatus::kInvalidParameter, "Not a mouse button");
  fButton = button;
  return VStatus::kSuccess;
}

unsigned int VEvent::modifiers(VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return fModifiers;
}

VStatus VEvent::setModifiers(unsigned int modifiers) {
  fModifiers = modifiers;
  return VStatus::kSuccess;
}

bool VEvent::isModifierNone() const { return fModifiers == kNoModifier; }
bool VEvent::isModifierShift() const { return (fModifiers & kShiftKey) != 0; }
bool VEvent::isModifierControl() const { return (fModifiers & kControlKey) != 0; }
bool VEvent::isModifierAlt() const { return (fModifiers & kAltKey) != 0; }

OPENVORLA_NAMESPACE_CLOSE
