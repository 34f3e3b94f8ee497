// VPxCacheFormat: the host's default format, which reads and writes nothing.
#include <openvorla/VPxCacheFormat.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxCacheFormat::VPxCacheFormat() { standin::noteConstructed("VPxCacheFormat"); }
VPxCacheFormat::~VPxCacheFormat() { standin::noteDestroyed("VPxCacheFormat"); }

VStatus VPxCacheFormat::open(const VString &, FileAccessMode) { return VStatus::kNotImplemented; }
void VPxCacheFormat::close() {}
VStatus VPxCacheFormat::isValid() { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::rewind() { return VStatus::kNotImplemented; }
VString VPxCacheFormat::extension() { return VString(); }
void VPxCacheFormat::flush() {}

VStatus VPxCacheFormat::readHeader() { return VStatus::kNotImplemented; }

VStatus VPxCacheFormat::writeHeader(const VString &, VTime &, VTime &) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::writeTime(VTime &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::readTime(VTime &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::findTime(VTime &, VTime &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::readNextTime(VTime &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::writeChannelName(const VString &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::findChannelName(const VString &) { return VStatus::kNotImplemented; }

unsigned int VPxCacheFormat::readArraySize() { return 0; }
VStatus VPxCacheFormat::writeDoubleArray(const VDoubleArray &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::writeFloatArray(const VFloatArray &) { return VStatus::kNotImplemented; }
VStatus VPxCacheFormat::writeIntArray(const VIntArray &) { return VStatus::kNotImplemented; }

VStatus VPxCacheFormat::writeDoubleVectorArray(const VVectorArray &) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::writeFloatVectorArray(const VFloatVectorArray &) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::writeInt32(int) { return VStatus::kNotImplemented; }

VStatus VPxCacheFormat::readDoubleArray(VDoubleArray &, unsigned int) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::readFloatArray(VFloatArray &, unsigned int) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::readIntArray(VIntArray &, unsigned int) { return VStatus::kNotImplemented; }

VStatus VPxCacheFormat::readDoubleVectorArray(VVectorArray &, unsigned int) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::readFloatVectorArray(VFloatVectorArray &, unsigned int) {
  return VStatus::kNotImplemented;
}

int VPxCacheFormat::readInt32() { return 0; }

bool VPxCacheFormat::handlesDescription() { return false; }

VStatus VPxCacheFormat::readDescription(VCacheFormatDescription &, const VString &,
                                        const VString &) {
  return VStatus::kNotImplemented;
}

VStatus VPxCacheFormat::writeDescription(const VCacheFormatDescription &, const VString &,
                                         const VString &) {
  return VStatus::kNotImplemented;
}

const char *VPxCacheFormat::className() { return "VPxCacheFormat"; }

void VPxCacheFormat::beginWriteChunk() {}
void VPxCacheFormat::endWriteChunk() {}
VStatus VPxCacheFormat::beginReadChunk() { return VStatus::kNotImplemented; }
void VPxCacheFormat::endReadChunk() {}

OPENVORLA_NAMESPACE_CLOSE
