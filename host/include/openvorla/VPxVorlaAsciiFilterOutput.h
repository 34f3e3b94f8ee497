// Output stream that an ASCII scene filter writes to. The host makes one for
// each file it writes and hands it to the filter's hooks.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxVorlaAsciiFilterOutput {
public:
  VPxVorlaAsciiFilterOutput();
  ~VPxVorlaAsciiFilterOutput();

  // Appends the text as it is.
  VPxVorlaAsciiFilterOutput &write(const VString &text);

  VPxVorlaAsciiFilterOutput &operator<<(const VString &text);
  VPxVorlaAsciiFilterOutput &operator<<(const char *text);  // null writes nothing
  VPxVorlaAsciiFilterOutput &operator<<(int value);
  VPxVorlaAsciiFilterOutput &operator<<(unsigned int value);
  // Shortest text that reads back as the same double.
  VPxVorlaAsciiFilterOutput &operator<<(double value);

private:
  VPxVorlaAsciiFilterOutput(const VPxVorlaAsciiFilterOutput &) = delete;
  VPxVorlaAsciiFilterOutput &operator=(const VPxVorlaAsciiFilterOutput &) = delete;

  friend class VPxVorlaAsciiFilterOutputText;
  VString fText;
};

OPENVORLA_NAMESPACE_CLOSE
