// Base class of plug-in MIDI input devices.
//
// The host opens the device, lets it name its axes and buttons, then polls
// it for messages and reads its state. The device declares its axes
// (0 to degreesOfFreedom() - 1) and buttons and names them; the host's own
// device has none and reports nothing.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDeviceState.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxMidiInputDevice {
public:
  VPxMidiInputDevice();
  virtual ~VPxMidiInputDevice();

  // kFailure by default: there is no hardware to open.
  virtual VStatus openDevice();
  virtual VStatus closeDevice();
  // Called after opening: the device names its axes and buttons here.
  virtual void nameAxes();
  virtual void nameButtons();
  // The current state, owned by the caller; null by default: no state.
  virtual VDeviceState *deviceState();
  // The next message of the device, owned by the device; null when none.
  virtual char *getMessage();
  virtual void sendMessage(const char *messageType, const char *messageParams);
  // Whether the device reports button presses and axis movements; it
  // reports both by default, and kSuccess.
  virtual VStatus doButtonEvents(bool enable = true);
  virtual VStatus doMovementEvents(bool enable = true);

  // kInvalidParameter for a negative count.
  VStatus setDegreesOfFreedom(int freedom);
  VStatus setPhysicalButtons(int buttons);
  int degreesOfFreedom() const;
  int physicalButtons() const;
  // Names an axis; kInvalidParameter for an axis out of range or a name
  // that another axis has.
  VStatus addChannel(int axis, const VString &channelName);
  // The axis of that name; -1 when no axis has it.
  int channelAxis(const VString &channelName) const;
  // Names the buttons start to end; kInvalidParameter when they are not
  // buttons of the device in that order.
  VStatus setNamedButton(const VString &name, int start, int end);
  bool buttonEventsEnabled() const;
  bool movementEventsEnabled() const;

private:
  int fFreedom;
  int fButtons;
  std::vector<VString> fChannels;
  bool fButtonEvents;
  bool fMovementEvents;
};

OPENVORLA_NAMESPACE_CLOSE
