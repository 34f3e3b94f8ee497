// VPxImageFile: the host's default reader, which reads nothing.
#include <openvorla/VPxImageFile.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxImageFile::VPxImageFile() { standin::noteConstructed("VPxImageFile"); }
VPxImageFile::~VPxImageFile() { standin::noteDestroyed("VPxImageFile"); }

VStatus VPxImageFile::open(const VString &, VImageFileInfo *) { return VStatus::kNotImplemented; }
VStatus VPxImageFile::load(VImage &, unsigned int) { return VStatus::kNotImplemented; }

VStatus VPxImageFile::glLoad(const VImageFileInfo &, unsigned int) {
  return VStatus::kNotImplemented;
}

VStatus VPxImageFile::close() { return VStatus::kNotImplemented; }

OPENVORLA_NAMESPACE_CLOSE
