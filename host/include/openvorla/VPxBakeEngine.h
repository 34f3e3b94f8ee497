// Base class of plug-in engines that bake shading networks.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxBakeEngine {
public:
  VPxBakeEngine();
  virtual ~VPxBakeEngine();

  virtual VStatus bake(const VObject &shadingNode, const VString &outputFile) = 0;
};

OPENVORLA_NAMESPACE_CLOSE
