// VPxFileTranslator: the host's default translator, and the access mode of the
// file operation that runs.
#include <openvorla/VPxFileTranslator.h>

#include <standin/Files.h>
#include <standin/Lifetime.h>

#include <atomic>

OPENVORLA_NAMESPACE_OPEN

namespace {

std::atomic<int> gAccessMode{VPxFileTranslator::kUnknownAccessMode};

}  // namespace

VPxFileTranslator::VPxFileTranslator() { standin::noteConstructed("VPxFileTranslator"); }
VPxFileTranslator::~VPxFileTranslator() { standin::noteDestroyed("VPxFileTranslator"); }

VStatus VPxFileTranslator::reader(const VFileObject &, const VString &, FileAccessMode) {
  return VStatus(VStatus::kNotImplemented, "The translator has no reader");
}

VStatus VPxFileTranslator::writer(const VFileObject &, const VString &, FileAccessMode) {
  return VStatus(VStatus::kNotImplemented, "The translator has no writer");
}

bool VPxFileTranslator::haveReadMethod() const { return false; }
bool VPxFileTranslator::haveWriteMethod() const { return false; }
bool VPxFileTranslator::haveReferenceMethod() const { return false; }
bool VPxFileTranslator::haveNamespaceSupport() const { return false; }
bool VPxFileTranslator::allowMultipleFileOptimization() const { return false; }
VString VPxFileTranslator::defaultExtension() const { return VString(); }

VString VPxFileTranslator::filter() const {
  VString extension = defaultExtension();
  return extension.numChars() ? VString("*.") + extension : VString("*.*");
}

bool VPxFileTranslator::canBeOpened() const { return true; }

VPxFileTranslator::VFileKind VPxFileTranslator::identifyFile(const VFileObject &, const char *,
                                                             short) const {
  return kNotMyFileType;
}

VPxFileTranslator::FileAccessMode VPxFileTranslator::fileAccessMode() {
  return static_cast<FileAccessMode>(gAccessMode.load());
}

OPENVORLA_NAMESPACE_CLOSE

void standin::setFileAccessMode(OPENVORLA_NAMESPACE::VPxFileTranslator::FileAccessMode mode) {
  OPENVORLA_NAMESPACE::gAccessMode.store(mode);
}
