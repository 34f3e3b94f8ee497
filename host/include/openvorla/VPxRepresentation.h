// Base class of the representations of plug-in assemblies.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxRepresentation {
public:
  VPxRepresentation();
  virtual ~VPxRepresentation();

  virtual bool activate() = 0;
  virtual VString getType() const = 0;
};

OPENVORLA_NAMESPACE_CLOSE
