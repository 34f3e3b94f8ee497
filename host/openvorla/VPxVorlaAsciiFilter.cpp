// VPxVorlaAsciiFilter: the host's ASCII reader and writer around a filter's hooks.
//
// The stand-in's scene is empty: the writer writes the frame of the file and
// the filter's additions.
#include <openvorla/VPxVorlaAsciiFilter.h>

#include <standin/Files.h>
#include <standin/Lifetime.h>

#include <mutex>
#include <string>

OPENVORLA_NAMESPACE_OPEN

namespace {

struct LastScene {
  std::mutex mutex;
  std::string text;
};

LastScene &lastScene() {
  static LastScene scene;
  return scene;
}

// Sets the filter's file for the duration of a write.
class CurrentFile {
 public:
  CurrentFile(VFileObject &slot, const VFileObject &file) : fSlot(slot) { fSlot = file; }
  ~CurrentFile() { fSlot = VFileObject(); }

 private:
  VFileObject &fSlot;
};

}  // namespace

VPxVorlaAsciiFilter::VPxVorlaAsciiFilter() { standin::noteConstructed("VPxVorlaAsciiFilter"); }
VPxVorlaAsciiFilter::~VPxVorlaAsciiFilter() { standin::noteDestroyed("VPxVorlaAsciiFilter"); }

VStatus VPxVorlaAsciiFilter::writer(const VFileObject &file, const VString &, FileAccessMode) {
  if (!file.isSet()) return VStatus(VStatus::kInvalidParameter, "No file to write");
  CurrentFile current(fFile, file);
  VPxVorlaAsciiFilterOutput out;
  VStatus status;
  out << "//Vorla ASCII 2025 scene\n//Name: " << file.rawName() << "\n";
  if (!(status = writePostHeader(out))) return status;
  if (writesRequirements()) {
    if (!(status = writePreRequirements(out))) return status;
    out << "requires vorla \"2025\";\n";
    if (!(status = writePostRequirements(out))) return status;
  }
  if (!(status = writePreCreateNodesBlock(out))) return status;
  if (!(status = writePostCreateNodesBlock(out))) return status;
  if (!(status = writePreConnectAttrsBlock(out))) return status;
  if (!(status = writePostConnectAttrsBlock(out))) return status;
  if (!(status = writePreTrailer(out))) return status;
  out << "// End of " << file.rawName() << "\n";

  LastScene &scene = lastScene();
  std::lock_guard<std::mutex> guard(scene.mutex);
  scene.text = standin::outputText(out);
  return VStatus::kSuccess;
}

bool VPxVorlaAsciiFilter::haveWriteMethod() const { return true; }
VString VPxVorlaAsciiFilter::defaultExtension() const { return "va"; }
bool VPxVorlaAsciiFilter::writesMetadata() const { return true; }

bool VPxVorlaAsciiFilter::writesRequirements() const { return true; }
bool VPxVorlaAsciiFilter::writesCreateNode(const VObject &) const { return true; }
bool VPxVorlaAsciiFilter::writesAddAttr(const VPlug &) const { return true; }
bool VPxVorlaAsciiFilter::writesSetAttr(const VPlug &) const { return true; }
bool VPxVorlaAsciiFilter::writesSelectNode(const VObject &) const { return true; }
bool VPxVorlaAsciiFilter::writesFileReference(const VFileObject &) const { return true; }

VStatus VPxVorlaAsciiFilter::writePostHeader(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePreRequirements(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePostRequirements(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePreCreateNodesBlock(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePostCreateNodesBlock(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePreConnectAttrsBlock(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePostConnectAttrsBlock(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}
VStatus VPxVorlaAsciiFilter::writePreTrailer(VPxVorlaAsciiFilterOutput &) {
  return VStatus::kSuccess;
}

VFileObject VPxVorlaAsciiFilter::file() const { return fFile; }

bool VPxVorlaAsciiFilter::writesConnectAttr(const VPlug &, const VPlug &) const { return true; }
bool VPxVorlaAsciiFilter::writesDisconnectAttr(const VPlug &, const VPlug &) const { return true; }
bool VPxVorlaAsciiFilter::writesParentNode(const VDagPath &, const VDagPath &) const {
  return true;
}

OPENVORLA_NAMESPACE_CLOSE

const char *standin::lastWrittenScene() {
  OPENVORLA_NAMESPACE::LastScene &scene = OPENVORLA_NAMESPACE::lastScene();
  std::lock_guard<std::mutex> guard(scene.mutex);
  return scene.text.c_str();
}
