// Host string. Its storage is the scripting engine's Tstring, which the engine
// reaches through the conversion operators.
#pragma once

#include <openvorla/VApiVersion.h>

#include <basekit/Tstring.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VString {
public:
  VString();
  VString(const char *utf8);
  VString(const wchar_t *text);
  VString(const VString &other);
  VString(VString &&other) noexcept;
  ~VString();
  VString &operator=(const VString &other);
  VString &operator=(VString &&other) noexcept;

  // UTF-8 text, valid while this string lives and is unchanged.
  const char *asUTF8() const;
  const wchar_t *asWChar() const;
  unsigned int numChars() const;
  unsigned int length() const;

  bool operator==(const VString &other) const;
  bool operator!=(const VString &other) const;
  VString &operator+=(const VString &other);
  VString operator+(const VString &other) const;

  operator Tstring &() { return fStr; }
  operator const Tstring &() const { return fStr; }

private:
  Tstring fStr;
};

OPENVORLA_NAMESPACE_CLOSE
