// Base class of plug-in UI controls.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxUIControl {
public:
  virtual ~VPxUIControl();

protected:
  VPxUIControl();
};

OPENVORLA_NAMESPACE_CLOSE
