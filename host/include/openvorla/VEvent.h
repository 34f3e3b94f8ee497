// A pointer event in a view: where it happened, the mouse button and the
// modifier keys held.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VEvent {
public:
  enum MouseButtonType {
    kLeftMouse = 1,
    kMiddleMouse = 2,
    kRightMouse = 4
  };

  enum ModifierType {
    kNoModifier = 0,
    kShiftKey = 1,
    kControlKey = 4,
    kAltKey = 8
  };

  VEvent();  // at (0, 0), left button, no modifier
  VEvent(short x, short y, MouseButtonType button = kLeftMouse,
         unsigned int modifiers = kNoModifier);
  VEvent(const VEvent &other);
  ~VEvent();
  VEvent &operator=(const VEvent &other);

  VStatus getPosition(short &x, short &y) const;
  VStatus setPosition(short x, short y);
  MouseButtonType mouseButton(VStatus *ReturnStatus = NULL) const;
  // kInvalidParameter for a value that is not one button.
  VStatus setMouseButton(MouseButtonType button);
  unsigned int modifiers(VStatus *ReturnStatus = NULL) const;
  VStatus setModifiers(unsigned int modifiers);
  bool isModifierNone() const;
  bool isModifierShift() const;
  bool isModifierControl() const;
  bool isModifierAlt() const;

private:
  short fX;
  short fY;
  MouseButtonType fButton;
  unsigned int fModifiers;
};

OPENVORLA_NAMESPACE_CLOSE
