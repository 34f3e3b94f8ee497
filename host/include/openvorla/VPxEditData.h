// Base class of plug-in data attached to edits.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxEditData {
public:
  VPxEditData();
  virtual ~VPxEditData();

  virtual bool performIsEqual(const VPxEditData &other) const = 0;
  virtual bool performIsLessThan(const VPxEditData &other) const = 0;
};

OPENVORLA_NAMESPACE_CLOSE
