// VStatus: status codes, host messages and their texts.
#include <openvorla/VStatus.h>

#include <basekit/Tlog.h>

#include <mutex>
#include <string>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

static_assert(sizeof(VStatus) == 3, "VStatus is three bytes: code, internal code, success");

namespace {

constexpr unsigned char kNoMessage = 0xFF;

// Host messages, recorded once per distinct text. The internal code of a status
// is the message's index, so at most 255 texts fit; a status made with a new
// text once the table is full carries no message and reports its code's text.
struct MessageTable {
  std::mutex mutex;
  std::vector<VString> texts;

  unsigned char record(const VString &message) {
    std::lock_guard<std::mutex> guard(mutex);
    for (size_t i = 0; i < texts.size(); ++i)
      if (texts[i] == message) return static_cast<unsigned char>(i);
    if (texts.size() == kNoMessage) return kNoMessage;
    texts.push_back(message);
    return static_cast<unsigned char>(texts.size() - 1);
  }

  VString text(unsigned char index) {
    std::lock_guard<std::mutex> guard(mutex);
    return texts[index];
  }
};

MessageTable &messages() {
  static MessageTable table;
  return table;
}

const char *codeText(unsigned char code) {
  static const char *const kTexts[] = {
      "Success",           "Failure",         "Insufficient memory",
      "Invalid parameter", "License failure", "Unknown parameter",
      "Not implemented",   "Not found",       "End of file"};
  return code < sizeof(kTexts) / sizeof(kTexts[0]) ? kTexts[code] : "Unknown status";
}

}  // namespace

VStatus::VStatus() : VStatus(kSuccess) {}

VStatus::VStatus(VStatusCode code)
    : fStatusCode(static_cast<unsigned char>(code)),
      fInternalStatusCode(kNoMessage),
      fSuccess(code == kSuccess) {}

VStatus::VStatus(VStatusCode code, const VString &message) : VStatus(code) {
  fInternalStatusCode = messages().record(message);
}

VStatus::VStatusCode VStatus::statusCode() const { return static_cast<VStatusCode>(fStatusCode); }
bool VStatus::error() const { return !fSuccess; }
VStatus::operator bool() const { return fSuccess; }
bool VStatus::operator==(const VStatus &other) const { return fStatusCode == other.fStatusCode; }
bool VStatus::operator==(VStatusCode code) const { return fStatusCode == code; }
bool VStatus::operator!=(const VStatus &other) const { return !(*this == other); }
bool VStatus::operator!=(VStatusCode code) const { return !(*this == code); }

VString VStatus::errorString() const {
  if (fInternalStatusCode != kNoMessage) return messages().text(fInternalStatusCode);
  return codeText(fStatusCode);
}

void VStatus::clear() { *this = VStatus(); }

void VStatus::perror(const char *prefix) const {
  std::string entry = prefix && *prefix ? std::string(prefix) + ": " : std::string();
  Tlog::write(entry + errorString().asUTF8());
}

OPENVORLA_NAMESPACE_CLOSE
