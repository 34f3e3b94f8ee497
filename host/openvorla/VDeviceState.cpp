// VDeviceState: axis positions and button states of an input device.
#include <openvorla/VDeviceState.h>

OPENVORLA_NAMESPACE_OPEN

VDeviceState::VDeviceState(unsigned int axes, unsigned int buttons)
    : fPositions(axes, 0), fButtons(buttons, false) {}
VDeviceState::VDeviceState(const VDeviceState &other) = default;
VDeviceState::~VDeviceState() = default;
VDeviceState &VDeviceState::operator=(const VDeviceState &other) = default;

bool VDeviceState::isNull() const { return fPositions.empty() && fButtons.empty(); }
unsigned int VDeviceState::maxAxis() const { return static_cast<unsigned int>(fPositions.size()); }
unsigned int VDeviceState::maxButton() const { return static_cast<unsigned int>(fButtons.size()); }

int VDeviceState::devicePosition(unsigned int axis) const {
  return axis < fPositions.size() ? fPositions[axis] : 0;
}

VStatus VDeviceState::setDevicePosition(int position, unsigned int axis) {
  if (axis >= fPositions.size()) return VStatus(VStatus::kInvalidParameter, "No such axis");
  fPositions[axis] = position;
  return VStatus::kSuccess;
}

bool VDeviceState::buttonState(unsigned int button) const {
  return button < fButtons.size() && fButtons[button];
}

VStatus VDeviceState::setButtonState(bool pressed, unsigned int button) {
  if (button >= fButtons.size()) return VStatus(VStatus::kInvalidParameter, "No such button");
  fButtons[button] = pressed;
  return VStatus::kSuccess;
}

OPENVORLA_NAMESPACE_CLOSE
