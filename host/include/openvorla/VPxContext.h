// Base class of plug-in interaction contexts.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxContext {
public:
  enum ImageIndex {
    kImage1,
    kImage2,
    kImage3
  };

  VPxContext();
  virtual ~VPxContext();
};

OPENVORLA_NAMESPACE_CLOSE
