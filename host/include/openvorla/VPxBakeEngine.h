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

protected:
  // For bake(): the part of the work done, 0 to 1, which the host shows in
  // its progress bar (kInvalidParameter outside that range), and whether the
  // user asked to stop, after which bake() returns kFailure.
  VStatus setProgress(double fraction);
  bool isInterruptRequested() const;

private:
  double fProgress;
};

OPENVORLA_NAMESPACE_CLOSE
