// Writing values to the streams that the host hands to a data type's
// writeASCII: text as it is, numbers as the shortest text that reads back.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <iosfwd>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VStreamUtils {
public:
  // kFailure when the stream cannot be written.
  static VStatus writeCharBuffer(std::ostream &out, const VString &text);
  static VStatus writeDouble(std::ostream &out, double value);
  static VStatus writeInt(std::ostream &out, int value);
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
