// Base class of plug-in interpolators between animation keys.
//
// The host calls initialize() for each interval between two keys of a curve
// that uses the interpolator, then evaluate() for times in that interval.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VString.h>
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
  // The curve and the index of the interval's first key; does nothing by default.
  virtual void initialize(const VObject &animCurve, unsigned int interval);

  // The InterpolatorFlags an interpolator type was registered with; 0 for a
  // type that no loaded plug-in registered.
  static int registeredFlags(const VString &typeName);
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
