// The spaces in which transformation components are given and read.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VSpace {
public:
  enum Space {
    kInvalid = 0,
    kTransform = 1,      // the space of the transformation's own components
    kPreTransform = 2,   // before the transformation is applied: the parent's axes
    kPostTransform = 3,  // after it is applied: the object's own axes
    kWorld = 4,
    kObject = kPreTransform,
    kLast = 5
  };
};

OPENVORLA_NAMESPACE_CLOSE
