// Function set for numeric data, and the numeric types an attribute holds.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnData.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnNumericData : public VFnData {
public:
  enum Type {
    kInvalid,
    kBoolean,
    kByte,
    kChar,
    kShort,
    kInt,
    kInt64,
    kFloat,
    kDouble,
    // Compounds of two to four numbers: points, vectors, colors.
    k2Float,
    k2Double,
    k3Float,
    k3Double,
    k4Double,
    kLast
  };

  VFnNumericData();
  ~VFnNumericData() override;

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
