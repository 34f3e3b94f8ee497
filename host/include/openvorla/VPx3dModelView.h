// Base class of plug-in 3D views.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPx3dModelView {
public:
  enum LightingMode {
    kLightAll,
    kLightSelected,
    kLightActive,
    kLightDefault,
    kLightNone,
    kLightQuality
  };

  enum FogSource {
    kFogFragment,
    kFogCoordinate
  };

  enum FogMode {
    kFogLinear,
    kFogExponential,
    kFogExponentialSquared
  };

  VPx3dModelView();
  virtual ~VPx3dModelView();
};

OPENVORLA_NAMESPACE_CLOSE
