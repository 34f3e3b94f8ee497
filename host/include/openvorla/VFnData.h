// Base of the function sets that operate on data objects, and the kinds of
// data a typed attribute holds.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFn.h>
#include <openvorla/VFnBase.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnData : public VFnBase {
public:
  enum Type {
    kInvalid,
    kNumeric,
    kPlugin,
    kPluginGeometry,
    kString,
    kMatrix,
    kStringArray,
    kDoubleArray,
    kIntArray,
    kPointArray,
    kVectorArray,
    kMesh,
    kAny,
    kLast
  };

  VFnData();
  ~VFnData() override;

  VFn::Type type() const override;  // kData
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
