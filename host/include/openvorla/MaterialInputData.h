// Material values that a material information object computes for the viewport.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

struct OPENVORLA_EXPORT MaterialInputData {
  MaterialInputData();
  ~MaterialInputData();
};

OPENVORLA_NAMESPACE_CLOSE
