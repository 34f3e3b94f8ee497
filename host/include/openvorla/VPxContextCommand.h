// Base class of the commands that create plug-in contexts.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxContextCommand {
public:
  VPxContextCommand();
  virtual ~VPxContextCommand();
};

OPENVORLA_NAMESPACE_CLOSE
