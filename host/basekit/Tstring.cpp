// Tstring: wide text with UTF-8 conversion in both directions.
#include <basekit/Tstring.h>

static_assert(sizeof(wchar_t) == 4, "Tstring keeps UTF-32 text in wchar_t");

namespace {

constexpr char32_t kReplacement = 0xFFFD;

// Decodes UTF-8. Each malformed or overlong sequence, encoded surrogate or value
// above 0x10FFFF becomes one U+FFFD, and decoding resumes at the next byte that
// can start a sequence.
std::wstring decodeUtf8(const char *utf8) {
  std::wstring out;
  auto *p = reinterpret_cast<const unsigned char *>(utf8);
  while (*p) {
    unsigned char lead = *p++;
    if (lead < 0x80) {
      out.push_back(static_cast<wchar_t>(lead));
      continue;
    }
    int extra = (lead & 0xE0) == 0xC0   ? 1
                : (lead & 0xF0) == 0xE0 ? 2
                : (lead & 0xF8) == 0xF0 ? 3
                                        : 0;
    if (extra == 0) {
      out.push_back(static_cast<wchar_t>(kReplacement));
      continue;
    }
    static constexpr char32_t kMinimum[] = {0, 0x80, 0x800, 0x10000};
    char32_t cp = lead & (0x3F >> extra);
    int taken = 0;
    for (; taken < extra && (*p & 0xC0) == 0x80; ++taken) cp = (cp << 6) | (*p++ & 0x3F);
    bool valid =
        taken == extra && cp >= kMinimum[extra] && cp <= 0x10FFFF && (cp < 0xD800 || cp > 0xDFFF);
    out.push_back(static_cast<wchar_t>(valid ? cp : kReplacement));
  }
  return out;
}

void encodeUtf8(const std::wstring &text, std::string &out) {
  out.clear();
  for (wchar_t wc : text) {
    auto cp = static_cast<char32_t>(wc);
    if ((cp >= 0xD800 && cp <= 0xDFFF) || cp > 0x10FFFF) cp = kReplacement;
    if (cp < 0x80) {
      out.push_back(static_cast<char>(cp));
    } else if (cp < 0x800) {
      out.push_back(static_cast<char>(0xC0 | (cp >> 6)));
      out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
    } else if (cp < 0x10000) {
      out.push_back(static_cast<char>(0xE0 | (cp >> 12)));
      out.push_back(static_cast<char>(0x80 | ((cp >> 6) & 0x3F)));
      out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
    } else {
      out.push_back(static_cast<char>(0xF0 | (cp >> 18)));
      out.push_back(static_cast<char>(0x80 | ((cp >> 12) & 0x3F)));
      out.push_back(static_cast<char>(0x80 | ((cp >> 6) & 0x3F)));
      out.push_back(static_cast<char>(0x80 | (cp & 0x3F)));
    }
  }
}

}  // namespace

Tstring::Tstring(const char *utf8) : fText(utf8 ? decodeUtf8(utf8) : std::wstring()) {}

Tstring::Tstring(const wchar_t *text) : fText(text ? text : L"") {}

Tstring::Tstring(const wchar_t *text, size_t count) : fText(text, count) {}

const char *Tstring::asUTF8() const {
  if (!fUtf8Valid) {
    encodeUtf8(fText, fUtf8);
    fUtf8Valid = true;
  }
  return fUtf8.c_str();
}

void Tstring::set(const wchar_t *text, size_t count) {
  fText.assign(text, count);
  fUtf8Valid = false;
}

void Tstring::setUTF8(const char *utf8) {
  fText = utf8 ? decodeUtf8(utf8) : std::wstring();
  fUtf8Valid = false;
}

void Tstring::append(const Tstring &other) {
  fText += other.fText;
  fUtf8Valid = false;
}

void Tstring::clear() {
  fText.clear();
  fUtf8Valid = false;
}
