// VPxVorlaAsciiFilterOutput: construction and destruction.
#include <openvorla/VPxVorlaAsciiFilterOutput.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxVorlaAsciiFilterOutput::VPxVorlaAsciiFilterOutput() {
  standin::noteConstructed("VPxVorlaAsciiFilterOutput");
}
VPxVorlaAsciiFilterOutput::~VPxVorlaAsciiFilterOutput() {
  standin::noteDestroyed("VPxVorlaAsciiFilterOutput");
}

OPENVORLA_NAMESPACE_CLOSE
