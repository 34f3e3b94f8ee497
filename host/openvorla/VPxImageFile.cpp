// VPxImageFile: construction and destruction.
#include <openvorla/VPxImageFile.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxImageFile::VPxImageFile() { standin::noteConstructed("VPxImageFile"); }
VPxImageFile::~VPxImageFile() { standin::noteDestroyed("VPxImageFile"); }

OPENVORLA_NAMESPACE_CLOSE
