// VString: host strings over the scripting engine's Tstring.
#include <openvorla/VString.h>

#include <utility>

OPENVORLA_NAMESPACE_OPEN

VString::VString() = default;
VString::VString(const char *utf8) : fStr(utf8) {}
VString::VString(const wchar_t *text) : fStr(text) {}
VString::VString(const VString &other) = default;
VString::VString(VString &&other) noexcept : fStr(std::move(other.fStr)) {}
VString::~VString() = default;
VString &VString::operator=(const VString &other) = default;

VString &VString::operator=(VString &&other) noexcept {
  fStr = std::move(other.fStr);
  return *this;
}

const char *VString::asUTF8() const { return fStr.asUTF8(); }
const wchar_t *VString::asWChar() const { return fStr.asW(); }
unsigned int VString::numChars() const { return fStr.numChars(); }
unsigned int VString::length() const { return fStr.numChars(); }

bool VString::operator==(const VString &other) const { return fStr == other.fStr; }
bool VString::operator!=(const VString &other) const { return fStr != other.fStr; }

VString &VString::operator+=(const VString &other) {
  fStr.append(other.fStr);
  return *this;
}

VString VString::operator+(const VString &other) const {
  VString sum(*this);
  return sum += other;
}

OPENVORLA_NAMESPACE_CLOSE
