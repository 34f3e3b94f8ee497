// Base class of plug-in resolvers of file URIs.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxFileResolver {
public:
  enum VFileResolverMode {
    kNone = 1,
    kInput
  };

  VPxFileResolver();
  virtual ~VPxFileResolver();
};

OPENVORLA_NAMESPACE_CLOSE
