// Output stream that an ASCII scene filter writes to.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxVorlaAsciiFilterOutput {
public:
  VPxVorlaAsciiFilterOutput();
  ~VPxVorlaAsciiFilterOutput();
};

OPENVORLA_NAMESPACE_CLOSE
