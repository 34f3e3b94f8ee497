// Base class of plug-in cache file formats.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxCacheFormat {
public:
  enum FileAccessMode {
    kRead,
    kWrite,
    kReadWrite
  };

  VPxCacheFormat();
  virtual ~VPxCacheFormat();
};

OPENVORLA_NAMESPACE_CLOSE
