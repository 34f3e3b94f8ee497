// Base class of plug-in MIDI input devices.
//
// The host opens the device and lets it name its axes and buttons, then
// polls it for messages and reads its state; it closes the device when the
// plug-in is unloaded. The host's own device has no hardware: it cannot be
// opened and reports nothing.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDeviceState.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxMidiInputDevice {
public:
  VPxMidiInputDevice();
  virtual ~VPxMidiInputDevice();

  // The next message of the device, owned by the device; null when none.
  virtual char *getMessage();
  virtual void sendMessage(const char *messageType, const char *messageParams);
  // Whether the device reports button presses and axis movements; it
  // reports both by default, and kSuccess.
  virtual VStatus doButtonEvents(bool enable = true);
  virtual VStatus doMovementEvents(bool enable = true);
  static const char *className();

protected:
  // kFailure by default: there is no hardware to open.
  virtual VStatus openDevice();
  virtual VStatus closeDevice();
  // Called after opening: the device names its axes and buttons here.
  virtual void nameAxes();
  virtual void nameButtons();
  // The current state, owned by the caller; null by default: no state.
  virtual VDeviceState *deviceState();
};

OPENVORLA_NAMESPACE_CLOSE
