// VPxMidiInputDevice: construction and destruction.
#include <openvorla/VPxMidiInputDevice.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxMidiInputDevice::VPxMidiInputDevice() { standin::noteConstructed("VPxMidiInputDevice"); }
VPxMidiInputDevice::~VPxMidiInputDevice() { standin::noteDestroyed("VPxMidiInputDevice"); }

OPENVORLA_NAMESPACE_CLOSE
