// VPxMidiInputDevice: the host's default device, and the axes and buttons a
// device declares.
#include <openvorla/VPxMidiInputDevice.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxMidiInputDevice::VPxMidiInputDevice()
    : fFreedom(0), fButtons(0), fButtonEvents(true), fMovementEvents(true) {
  standin::noteConstructed("VPxMidiInputDevice");
}

VPxMidiInputDevice::~VPxMidiInputDevice() { standin::noteDestroyed("VPxMidiInputDevice"); }

VStatus VPxMidiInputDevice::openDevice() {
  return VStatus(VStatus::kFailure, "The device has no hardware to open");
}

VStatus VPxMidiInputDevice::closeDevice() { return VStatus::kSuccess; }
void VPxMidiInputDevice::nameAxes() {}
void VPxMidiInputDevice::nameButtons() {}
VDeviceState *VPxMidiInputDevice::deviceState() { return nullptr; }
char *VPxMidiInputDevice::getMessage() { return nullptr; }
void VPxMidiInputDevice::sendMessage(const char *, const char *) {}

VStatus VPxMidiInputDevice::doButtonEvents(bool enable) {
  fButtonEvents = enable;
  return VStatus::kSuccess;
}

VStatus VPxMidiInputDevice::doMovementEvents(bool enable) {
  fMovementEvents = enable;
  return VStatus::kSuccess;
}

VStatus VPxMidiInputDevice::setDegreesOfFreedom(int freedom) {
  if (freedom < 0) return VStatus(VStatus::kInvalidParameter, "Negative number of axes");
  fFreedom = freedom;
  fChannels.resize(freedom);
  return VStatus::kSuccess;
}

VStatus VPxMidiInputDevice::setPhysicalButtons(int buttons) {
  if (buttons < 0) return VStatus(VStatus::kInvalidParameter, "Negative number of buttons");
  fButtons = buttons;
  return VStatus::kSuccess;
}

int VPxMidiInputDevice::degreesOfFreedom() const { return fFreedom; }
int VPxMidiInputDevice::physicalButtons() const { return fButtons; }

VStatus VPxMidiInputDevice::addChannel(int axis, const VString &channelName) {
  if (axis < 0 || axis >= fFreedom) return VStatus(VStatus::kInvalidParameter, "No such axis");
  int named = channelAxis(channelName);
  if (channelName.numChars() == 0 || (named != -1 && named != axis))
    return VStatus(VStatus::kInvalidParameter, "The channel name is empty or taken");
  fChannels[axis] = channelName;
  return VStatus::kSuccess;
}

int VPxMidiInputDevice::channelAxis(const VString &channelName) const {
  for (int axis = 0; axis < fFreedom; ++axis)
    if (channelName.numChars() && fChannels[axis] == channelName) return axis;
  return -1;
}

VStatus VPxMidiInputDevice::setNamedButton(const VString &name, int start, int end) {
  if (name.numChars() == 0 || start < 0 || start > end || end >= fButtons)
    return VStatus(VStatus::kInvalidParameter, "Not a named range of the device's buttons");
  return VStatus::kSuccess;
}

bool VPxMidiInputDevice::buttonEventsEnabled() const { return fButtonEvents; }
bool VPxMidiInputDevice::movementEventsEnabled() const { return fMovementEvents; }

OPENVORLA_NAMESPACE_CLOSE
