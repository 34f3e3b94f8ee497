// VFileObject: file names split into directory and name.
#include <openvorla/VFileObject.h>

#include <cctype>
#include <cstdlib>
#include <string>

OPENVORLA_NAMESPACE_OPEN

VFileObject::VFileObject() = default;
VFileObject::VFileObject(const VFileObject &other) = default;
VFileObject::~VFileObject() = default;
VFileObject &VFileObject::operator=(const VFileObject &other) = default;

VStatus VFileObject::setRawName(const VString &name) {
  if (std::string(name.asUTF8()).find('/') != std::string::npos)
    return VStatus(VStatus::kInvalidParameter, "A file name holds no separator");
  fName = name;
  return VStatus::kSuccess;
}

VStatus VFileObject::setRawPath(const VString &path) {
  std::string text = path.asUTF8();
  if (!text.empty() && text.back() != '/') text += '/';
  fPath = text.c_str();
  return VStatus::kSuccess;
}

VStatus VFileObject::setRawFullName(const VString &fullName) {
  std::string text = fullName.asUTF8();
  std::string::size_type cut = text.rfind('/');
  std::string::size_type nameStart = cut == std::string::npos ? 0 : cut + 1;
  fPath = text.substr(0, nameStart).c_str();
  fName = text.substr(nameStart).c_str();
  return VStatus::kSuccess;
}

VString VFileObject::rawName() const { return fName; }
VString VFileObject::rawPath() const { return fPath; }
VString VFileObject::rawFullName() const { return fPath + fName; }

namespace {

bool isNameChar(char c) { return std::isalnum(static_cast<unsigned char>(c)) || c == '_'; }

std::string environment(const std::string &name) {
  const char *value = std::getenv(name.c_str());
  return value ? value : "";
}

}  // namespace

VString VFileObject::expandedFullName() const {
  std::string raw = rawFullName().asUTF8(), out;
  std::string::size_type i = 0;
  if (raw.compare(0, 2, "~/") == 0) {
    out = environment("HOME");
    i = 1;
  }
  while (i < raw.size()) {
    if (raw[i] != '$') {
      out += raw[i++];
      continue;
    }
    std::string::size_type start = i + 1, end;
    if (start < raw.size() && raw[start] == '{') {
      end = raw.find('}', start);
      if (end == std::string::npos) {  // not a variable: kept as written
        out += raw.substr(i);
        break;
      }
      out += environment(raw.substr(start + 1, end - start - 1));
      i = end + 1;
    } else {
      for (end = start; end < raw.size() && isNameChar(raw[end]); ++end) {
      }
      if (end == start)
        out += '$';
      else
        out += environment(raw.substr(start, end - start));
      i = end;
    }
  }
  return out.c_str();
}

VString VFileObject::extension() const {
  std::string name = fName.asUTF8();
  std::string::size_type dot = name.rfind('.');
  return dot == std::string::npos ? VString() : VString(name.substr(dot + 1).c_str());
}

bool VFileObject::isSet() const { return fName.numChars() != 0; }

bool VFileObject::operator==(const VFileObject &other) const {
  return fPath == other.fPath && fName == other.fName;
}

bool VFileObject::operator!=(const VFileObject &other) const { return !(*this == other); }

OPENVORLA_NAMESPACE_CLOSE
