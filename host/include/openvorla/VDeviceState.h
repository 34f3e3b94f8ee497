// State of an input device: the position of each axis and whether each button
// is pressed.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VDeviceState {
public:
  // Every axis at 0, every button released.
  VDeviceState(unsigned int axes = 0, unsigned int buttons = 0);
  VDeviceState(const VDeviceState &other);
  ~VDeviceState();
  VDeviceState &operator=(const VDeviceState &other);

  // A state without axes and buttons.
  bool isNull() const;
  unsigned int maxAxis() const;
  unsigned int maxButton() const;
  // Out of range: 0 or false, and kInvalidParameter from the setters.
  int devicePosition(unsigned int axis) const;
  VStatus setDevicePosition(int position, unsigned int axis);
  bool buttonState(unsigned int button) const;
  VStatus setButtonState(bool pressed, unsigned int button);

private:
  std::vector<int> fPositions;
  std::vector<bool> fButtons;
};

OPENVORLA_NAMESPACE_CLOSE
