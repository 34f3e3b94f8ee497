// VPxData: construction, destruction and the default file reading and writing.
#include <openvorla/VPxData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxData::VPxData() { standin::noteConstructed("VPxData"); }
VPxData::~VPxData() { standin::noteDestroyed("VPxData"); }

VStatus VPxData::readASCII(const VArgList &, unsigned int &) { return VStatus::kNotImplemented; }
VStatus VPxData::writeASCII(std::ostream &) { return VStatus::kNotImplemented; }
VStatus VPxData::readBinary(std::istream &, unsigned int) { return VStatus::kNotImplemented; }
VStatus VPxData::writeBinary(std::ostream &) { return VStatus::kNotImplemented; }

OPENVORLA_NAMESPACE_CLOSE
