// Base class of plug-in interpolators between animation keys.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VTime.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxAnimCurveInterpolator {
public:
  enum InterpolatorFlags {
    kEvaluateAtKey = 1,
    kLockType = 2
  };

  VPxAnimCurveInterpolator();
  virtual ~VPxAnimCurveInterpolator();

  virtual double evaluate(const VTime &time) = 0;
};

OPENVORLA_NAMESPACE_CLOSE
