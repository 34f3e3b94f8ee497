// Base class of plug-in iterators over the components of a geometry.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxGeometryIterator {
public:
  VPxGeometryIterator();
  virtual ~VPxGeometryIterator();
};

OPENVORLA_NAMESPACE_CLOSE
