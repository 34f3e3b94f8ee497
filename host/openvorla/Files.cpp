// Scene files through registered file translators: made for the one file
// operation and deleted after it.
#include <openvorla/VFileObject.h>
#include <openvorla/VPxFileTranslator.h>

#include <standin/Files.h>
#include <standin/Graph.h>
#include <standin/Registry.h>

#include <algorithm>
#include <utility>
#include <vector>

#include "HostCalls.h"

namespace standin {

using namespace OPENVORLA_NAMESPACE;
using host::failed;
using host::failure;
using host::guardedVoid;
using host::quoted;

namespace {

// "a=1;b=2" as its pairs in order; a part without '=' is a name alone.
std::vector<std::pair<std::string, std::string>> pairsOf(const std::string &options) {
  std::vector<std::pair<std::string, std::string>> pairs;
  size_t start = 0;
  while (start <= options.size()) {
    size_t end = options.find(';', start);
    if (end == std::string::npos) end = options.size();
    std::string part = options.substr(start, end - start);
    if (!part.empty()) {
      size_t equals = part.find('=');
      pairs.emplace_back(part.substr(0, equals),
                         equals == std::string::npos ? "" : part.substr(equals));
    }
    start = end + 1;
  }
  return pairs;
}

VStatus transfer(const std::string &path, const std::string &name, const std::string &options,
                 bool write) {
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
    const VString given(
        Files::mergeOptions(translatorDefaultOptions(name.c_str()), options).c_str());
    status = host::inPlugin(translator, write ? "writer" : "reader", describe, [&] {
      return write ? translator->writer(file, given, mode) : translator->reader(file, given, mode);
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

std::string Files::mergeOptions(const std::string &defaults, const std::string &options) {
  auto merged = pairsOf(defaults);
  for (const auto &pair : pairsOf(options)) {
    auto same = std::find_if(merged.begin(), merged.end(),
                             [&](const auto &p) { return p.first == pair.first; });
    if (same != merged.end())
      same->second = pair.second;
    else
      merged.push_back(pair);
  }
  std::string text;
  for (const auto &pair : merged) text += (text.empty() ? "" : ";") + pair.first + pair.second;
  return text;
}

VStatus Files::exportScene(const std::string &path, const std::string &translator,
                           const std::string &options) {
  return transfer(path, translator, options, true);
}

VStatus Files::importScene(const std::string &path, const std::string &translator,
                           const std::string &options) {
  return transfer(path, translator, options, false);
}

}  // namespace standin
