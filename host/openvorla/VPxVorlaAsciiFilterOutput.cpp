// VPxVorlaAsciiFilterOutput: the text stream of an ASCII scene file.
#include <openvorla/VPxVorlaAsciiFilterOutput.h>

#include <standin/Files.h>
#include <standin/Lifetime.h>

#include <cstdio>
#include <cstdlib>

OPENVORLA_NAMESPACE_OPEN

// The host's access to the text written.
class VPxVorlaAsciiFilterOutputText {
 public:
  static const VString &of(const VPxVorlaAsciiFilterOutput &out) { return out.fText; }
};

VPxVorlaAsciiFilterOutput::VPxVorlaAsciiFilterOutput() {
  standin::noteConstructed("VPxVorlaAsciiFilterOutput");
}

VPxVorlaAsciiFilterOutput::~VPxVorlaAsciiFilterOutput() {
  standin::noteDestroyed("VPxVorlaAsciiFilterOutput");
}

VPxVorlaAsciiFilterOutput &VPxVorlaAsciiFilterOutput::write(const VString &text) {
  fText += text;
  return *this;
}

VPxVorlaAsciiFilterOutput &VPxVorlaAsciiFilterOutput::operator<<(const VString &text) {
  return write(text);
}

VPxVorlaAsciiFilterOutput &VPxVorlaAsciiFilterOutput::operator<<(const char *text) {
  return text ? write(VString(text)) : *this;
}

VPxVorlaAsciiFilterOutput &VPxVorlaAsciiFilterOutput::operator<<(int value) {
  char text[16];
  std::snprintf(text, sizeof text, "%d", value);
  return write(text);
}

VPxVorlaAsciiFilterOutput &VPxVorlaAsciiFilterOutput::operator<<(unsigned int value) {
  char text[16];
  std::snprintf(text, sizeof text, "%u", value);
  return write(text);
}

VPxVorlaAsciiFilterOutput &VPxVorlaAsciiFilterOutput::operator<<(double value) {
  char text[32];
  for (int precision = 1; precision <= 17; ++precision) {
    std::snprintf(text, sizeof text, "%.*g", precision, value);
    if (std::strtod(text, nullptr) == value) break;
  }
  return write(text);
}

OPENVORLA_NAMESPACE_CLOSE

const char *standin::outputText(const OPENVORLA_NAMESPACE::VPxVorlaAsciiFilterOutput &out) {
  return OPENVORLA_NAMESPACE::VPxVorlaAsciiFilterOutputText::of(out).asUTF8();
}
