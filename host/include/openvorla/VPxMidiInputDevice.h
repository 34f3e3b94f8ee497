// Base class of plug-in MIDI input devices.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxMidiInputDevice {
public:
  VPxMidiInputDevice();
  virtual ~VPxMidiInputDevice();
};

OPENVORLA_NAMESPACE_CLOSE
