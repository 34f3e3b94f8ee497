// VPxMidiInputDevice: the host's default device, which has no hardware.
#include <openvorla/VPxMidiInputDevice.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxMidiInputDevice::VPxMidiInputDevice() { standin::noteConstructed("VPxMidiInputDevice"); }
VPxMidiInputDevice::~VPxMidiInputDevice() { standin::noteDestroyed("VPxMidiInputDevice"); }

char *VPxMidiInputDevice::getMessage() { return nullptr; }
void VPxMidiInputDevice::sendMessage(const char *, const char *) {}
VStatus VPxMidiInputDevice::doButtonEvents(bool) { return VStatus::kSuccess; }
VStatus VPxMidiInputDevice::doMovementEvents(bool) { return VStatus::kSuccess; }
const char *VPxMidiInputDevice::className() { return "VPxMidiInputDevice"; }

VStatus VPxMidiInputDevice::openDevice() {
  return VStatus(VStatus::kFailure, "The device has no hardware to open");
}

VStatus VPxMidiInputDevice::closeDevice() { return VStatus::kSuccess; }
void VPxMidiInputDevice::nameAxes() {}
void VPxMidiInputDevice::nameButtons() {}
VDeviceState *VPxMidiInputDevice::deviceState() { return nullptr; }

OPENVORLA_NAMESPACE_CLOSE
