// VPxVorlaAsciiFilter: construction and destruction.
#include <openvorla/VPxVorlaAsciiFilter.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxVorlaAsciiFilter::VPxVorlaAsciiFilter() { standin::noteConstructed("VPxVorlaAsciiFilter"); }
VPxVorlaAsciiFilter::~VPxVorlaAsciiFilter() { standin::noteDestroyed("VPxVorlaAsciiFilter"); }

OPENVORLA_NAMESPACE_CLOSE
