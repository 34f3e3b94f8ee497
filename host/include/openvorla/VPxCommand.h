// Base class of plug-in commands.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxCommand {
public:
  enum VResultType {
    kLong,
    kDouble,
    kString,
    kNoArg
  };

  VPxCommand();
  virtual ~VPxCommand();
};

OPENVORLA_NAMESPACE_CLOSE
