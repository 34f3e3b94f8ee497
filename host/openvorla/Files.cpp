// Scene files through registered file translators: made for the one file
// operation and deleted after it.
#include <openvorla/VFileObject.h>
#include <openvorla/VPxFileTranslator.h>

#include <standin/Files.h>
#include <standin/Graph.h>
#include <standin/Registry.h>

#include "HostCalls.h"

namespace standin {

using namespace OPENVORLA_NAMESPACE;
using host::failed;
using host::failure;
using host::guardedVoid;
using host::quoted;

namespace {

VStatus transfer(const std::string &path, const std::string &name, bool write) {
  if (path.empty()) return failure(VStatus::kInvalidParameter, "A scene file needs a path");
  const std::string doing = (write ? "writing " : "reading ") + quoted(path) +
                            " with the file translator " + quoted(name);
  auto describe = [&] {
    return Operation::Description{host::pluginOf({"FileTranslator"}, name), doing};
  };
  VPxFileTranslator *translator = nullptr;
  VStatus status = host::inPluginVoid(
      nullptr, nullptr, describe, [&] { translator = standin::createTranslator(name.c_str()); });
  if (!translator) {
    if (!host::isRegistered({"FileTranslator"}, name))
      return failure(VStatus::kNotFound,
                     "No file translator named " + quoted(name) + " is registered");
    return host::madeNone(
        "The creator of the file translator " + quoted(name) + " made no translator", status);
  }
  const std::string what = "The file translator " + quoted(name);
  bool able = false;
  status = host::inPluginVoid(
      translator, write ? "haveWriteMethod" : "haveReadMethod", describe,
      [&] { able = write ? translator->haveWriteMethod() : translator->haveReadMethod(); });
  if (status && !able)
    status = failure(VStatus::kNotImplemented,
                     what + (write ? " does not write files" : " does not read files"));
  if (status) {
    VFileObject file;
    file.setRawFullName(path.c_str());
    const VPxFileTranslator::FileAccessMode mode =
        write ? VPxFileTranslator::kExportAccessMode : VPxFileTranslator::kImportAccessMode;
    standin::setFileAccessMode(mode);
    status = host::inPlugin(translator, write ? "writer" : "reader", describe, [&] {
      return write ? translator->writer(file, VString(), mode)
                   : translator->reader(file, VString(), mode);
    });
    standin::setFileAccessMode(VPxFileTranslator::kUnknownAccessMode);
    if (!status)
      status = failed((write ? "Writing " : "Reading ") + quoted(path) +
                          " with the file translator " + quoted(name),
                      status);
  }
  guardedVoid([&] { standin::deleteTranslator(translator); });
  return status;
}

}  // namespace

VStatus Files::exportScene(const std::string &path, const std::string &translator) {
  return transfer(path, translator, true);
}

VStatus Files::importScene(const std::string &path, const std::string &translator) {
  return transfer(path, translator, false);
}

}  // namespace standin
