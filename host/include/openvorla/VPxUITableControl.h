// Base class of plug-in table controls.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxUIControl.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxUITableControl : public VPxUIControl {
public:
  enum LabelType {
    kNoLabel,
    kRowLabel,
    kColumnLabel,
    kAllLabels
  };

  VPxUITableControl();
  ~VPxUITableControl() override;
};

OPENVORLA_NAMESPACE_CLOSE
