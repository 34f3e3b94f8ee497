// A registered data type read from ASCII text, copied, and written back, as
// the application does when it loads, duplicates and saves a value.
#include <openvorla/VArgList.h>
#include <openvorla/VPxData.h>

#include <standin/Graph.h>
#include <standin/Registry.h>

#include <cctype>
#include <sstream>

#include "HostCalls.h"

namespace standin {

using namespace OPENVORLA_NAMESPACE;
using host::failed;
using host::failure;
using host::guardedVoid;
using host::quoted;

namespace {

// The words of the text, as a scene file holds them: separated by white
// space; a double-quoted word may hold blanks and loses its quotes.
VArgList words(const std::string &text) {
  VArgList args;
  std::string::size_type i = 0;
  while (i < text.size()) {
    if (std::isspace(static_cast<unsigned char>(text[i]))) {
      ++i;
      continue;
    }
    std::string word;
    if (text[i] == '"') {
      std::string::size_type end = text.find('"', i + 1);
      if (end == std::string::npos) end = text.size();
      word = text.substr(i + 1, end - i - 1);
      i = end + 1;
    } else {
      while (i < text.size() && !std::isspace(static_cast<unsigned char>(text[i])))
        word += text[i++];
    }
    args.addArg(VString(word.c_str()));
  }
  return args;
}

// What the round trip is doing with the data type, for the reports of its
// plug-in's failures.
struct Step {
  const std::string &type;
  const char *doing;  // "reading", ...
  const char *how;    // " from ASCII", ...
  Operation::Description operator()() const {
    return {host::pluginOf({"Data"}, type),
            std::string(doing) + " the data type " + quoted(type) + how};
  }
};

class Instance {
 public:
  ~Instance() {
    if (fData) guardedVoid([&] { standin::deleteData(fData); });
  }
  VStatus make(const std::string &type) {
    VStatus status = host::inPluginVoid(nullptr, nullptr, Step{type, "creating", ""}, [&] {
      fData = standin::createData(VString(type.c_str()));
    });
    if (fData) return status;
    if (!host::isRegistered({"Data"}, type))
      return failure(VStatus::kNotFound, "No data type named " + quoted(type) + " is registered");
    return host::madeNone("The creator of the data type " + quoted(type) + " made no data", status);
  }
  VPxData &operator*() { return *fData; }
  VPxData *operator->() { return fData; }

 private:
  VPxData *fData = nullptr;
};

}  // namespace

VStatus roundTripData(const std::string &dataType, const std::string &text, std::string *written,
                      std::string *copied) {
  const std::string what = " the data type " + quoted(dataType);
  Instance read, copy;
  VStatus status = read.make(dataType);
  if (!status) return status;
  VArgList args = words(text);
  unsigned int last = 0;
  status = host::inPlugin(&*read, "readASCII", Step{dataType, "reading", " from ASCII"},
                          [&] { return read->readASCII(args, last); });
  if (!status) return failed("Reading" + what + " from ASCII", status);
  status = copy.make(dataType);
  if (!status) return status;
  status =
      host::inPluginVoid(&*copy, "copy", Step{dataType, "copying", ""}, [&] { copy->copy(*read); });
  if (!status) return failed("Copying" + what, status);
  for (auto [data, out] : {std::make_pair(&read, written), std::make_pair(&copy, copied)}) {
    std::ostringstream stream;
    status = host::inPlugin(&**data, "writeASCII", Step{dataType, "writing", " as ASCII"},
                            [&] { return (*data)->writeASCII(stream); });
    if (!status) return failed("Writing" + what + " as ASCII", status);
    if (out) *out = stream.str();
  }
  return VStatus::kSuccess;
}

}  // namespace standin
