// Base class of the commands that create plug-in UI controls.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxUIControl.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxControlCommand {
public:
  VPxControlCommand();
  virtual ~VPxControlCommand();

  virtual VPxUIControl *makeControl() = 0;
};

OPENVORLA_NAMESPACE_CLOSE
