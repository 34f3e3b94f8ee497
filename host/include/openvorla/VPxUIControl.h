// Base class of plug-in UI controls. The host makes the widget; the control
// only answers the host's questions about its content, in derived classes.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxUIControl {
public:
  virtual ~VPxUIControl();

  static const char *className();

protected:
  VPxUIControl();
};

OPENVORLA_NAMESPACE_CLOSE
