// Function set for transform nodes. The stand-in gives only its limit kinds,
// which transform nodes of plug-ins use too.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnBase.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnTransform : public VFnBase {
public:
  // Component limits: minimum and maximum of each axis of translation,
  // rotation and scale.
  enum LimitType {
    kScaleMinX,
    kScaleMaxX,
    kScaleMinY,
    kScaleMaxY,
    kScaleMinZ,
    kScaleMaxZ,
    kRotateMinX,
    kRotateMaxX,
    kRotateMinY,
    kRotateMaxY,
    kRotateMinZ,
    kRotateMaxZ,
    kTranslateMinX,
    kTranslateMaxX,
    kTranslateMinY,
    kTranslateMaxY,
    kTranslateMinZ,
    kTranslateMaxZ
  };

  VFnTransform();
  explicit VFnTransform(const VObject &object);
  ~VFnTransform() override;
  VFn::Type type() const override;  // kTransform
};

OPENVORLA_NAMESPACE_CLOSE
