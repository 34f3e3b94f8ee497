// Base class of plug-in UI controls. The host makes the widget; the control
// only answers the host's questions about its content, in derived classes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxUIControl {
public:
  virtual ~VPxUIControl();

protected:
  VPxUIControl();

  // Sets a flag of the host's widget, as the control's command would with
  // that flag and value; kInvalidParameter for a flag without a name.
  VStatus setWidgetFlag(const VString &longFlag, bool value);
  VStatus setWidgetFlag(const VString &longFlag, int value);
  VStatus setWidgetFlag(const VString &longFlag, double value);
  VStatus setWidgetFlag(const VString &longFlag, const VString &value);
};

OPENVORLA_NAMESPACE_CLOSE
