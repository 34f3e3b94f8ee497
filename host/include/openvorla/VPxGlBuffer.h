// Base class of offscreen buffers that plug-ins draw into.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxGlBuffer {
public:
  VPxGlBuffer();
  virtual ~VPxGlBuffer();
};

OPENVORLA_NAMESPACE_CLOSE
