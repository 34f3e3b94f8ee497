// VStringArray: host string arrays over the scripting engine's TstringArray.
#include <openvorla/VStringArray.h>

OPENVORLA_NAMESPACE_OPEN

VStringArray::VStringArray() = default;
VStringArray::VStringArray(const VStringArray &other) = default;
VStringArray::~VStringArray() = default;
VStringArray &VStringArray::operator=(const VStringArray &other) = default;

VString VStringArray::operator[](unsigned int index) const {
  VString element;
  static_cast<Tstring &>(element) = fArray[index];
  return element;
}

VStatus VStringArray::set(const VString &element, unsigned int index) {
  if (index >= length()) return VStatus::kInvalidParameter;
  fArray[index] = element;
  return VStatus::kSuccess;
}

VStatus VStringArray::append(const VString &element) {
  fArray.append(element);
  return VStatus::kSuccess;
}

VStatus VStringArray::clear() {
  fArray.clear();
  return VStatus::kSuccess;
}

unsigned int VStringArray::length() const { return static_cast<unsigned int>(fArray.length()); }

OPENVORLA_NAMESPACE_CLOSE
