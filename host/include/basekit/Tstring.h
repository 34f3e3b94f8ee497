// The application's string: wide text (wchar_t, UTF-32 here) with a UTF-8 view.
#pragma once

#include <basekit/Texport.h>

#include <cstddef>
#include <string>

class T_EXPORT Tstring {
public:
  Tstring() = default;
  Tstring(const char *utf8);
  Tstring(const wchar_t *text);
  Tstring(const wchar_t *text, size_t count);

  // The text as wide characters; numChars() counts them, embedded zeros included.
  const wchar_t *asW() const { return fText.c_str(); }
  unsigned int numChars() const { return static_cast<unsigned int>(fText.size()); }

  // The text as UTF-8, valid until the string changes or dies. Characters that
  // are not Unicode scalar values (lone surrogates, values above 0x10FFFF) are
  // written as U+FFFD.
  const char *asUTF8() const;

  void set(const wchar_t *text, size_t count);
  void setUTF8(const char *utf8);
  void append(const Tstring &other);
  void clear();

  bool operator==(const Tstring &other) const { return fText == other.fText; }
  bool operator!=(const Tstring &other) const { return fText != other.fText; }

private:
  std::wstring fText;
  mutable std::string fUtf8;  // cache of asUTF8(); every change clears fUtf8Valid
  mutable bool fUtf8Valid = false;
};
