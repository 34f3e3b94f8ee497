// Numbers as the host writes them in text: the shortest of the usual
// precisions that reads back as the same double.
#pragma once

#include <openvorla/VApiVersion.h>

#include <cstdio>
#include <cstdlib>
#include <string>

OPENVORLA_NAMESPACE_OPEN

inline std::string formatDouble(double value) {
  char text[32];
  std::snprintf(text, sizeof text, "%.15g", value);
  if (std::strtod(text, nullptr) != value) std::snprintf(text, sizeof text, "%.17g", value);
  return text;
}

OPENVORLA_NAMESPACE_CLOSE
