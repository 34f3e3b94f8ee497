// What the application's engines share when they call into plug-ins: statuses
// with readable messages, and C++ exceptions kept from crossing into the host.
#pragma once

#include <openvorla/VStatus.h>

#include <standin/Operation.h>

#include <exception>
#include <initializer_list>
#include <string>
#include <utility>

namespace standin {
namespace host {

namespace ov = OPENVORLA_NAMESPACE;

inline std::string quoted(const std::string &text) { return "'" + text + "'"; }

inline ov::VStatus failure(ov::VStatus::VStatusCode code, const std::string &message) {
  return ov::VStatus(code, message.c_str());
}

// "<what> failed: <the status's text>", with the status's code.
inline ov::VStatus failed(const std::string &what, const ov::VStatus &status) {
  return failure(status.statusCode(), what + " failed: " + status.errorString().asUTF8());
}

// Calls into plug-in code: a C++ exception that leaves it (a director's own
// among them) becomes a failure carrying its message.
template <typename Call>
ov::VStatus guarded(Call call) {
  try {
    return call();
  } catch (const std::exception &e) {
    return failure(ov::VStatus::kFailure, e.what());
  } catch (...) {
    return failure(ov::VStatus::kFailure, "An unknown C++ exception left the plug-in");
  }
}

// As guarded, for a call with no status: success unless it threw.
template <typename Call>
ov::VStatus guardedVoid(Call call) {
  return guarded([&] {
    call();
    return ov::VStatus(ov::VStatus::kSuccess);
  });
}

// The text with its first letter in lower case: "Undoing" as in "undoing ...".
inline std::string lowered(std::string text) {
  if (!text.empty() && text[0] >= 'A' && text[0] <= 'Z') text[0] = static_cast<char>(text[0] + 32);
  return text;
}

// The failure of a creator that made nothing: the reason, when there is one
// (the creator's exception), follows the text.
inline ov::VStatus madeNone(const std::string &what, const ov::VStatus &status) {
  if (status) return failure(ov::VStatus::kFailure, what);
  return failure(status.statusCode(), what + ": " + status.errorString().asUTF8());
}

// Calls into plug-in code as an operation of the host (see Operation): as
// guarded, and when the scripting engine reported a Python exception meanwhile
// the call fails with the exception's type and text as its message, whatever
// it returned: a method without a status fails through its exception alone.
template <typename Describe, typename Call>
ov::VStatus inPlugin(const void *object, const char *method, Describe describe, Call call) {
  Doing<Describe> operation(object, method, std::move(describe));
  ov::VStatus status = guarded(call);
  if (operation.failure().empty()) return status;
  return failure(status ? ov::VStatus::kFailure : status.statusCode(), operation.failure());
}

template <typename Describe, typename Call>
ov::VStatus inPluginVoid(const void *object, const char *method, Describe describe, Call call) {
  return inPlugin(object, method, std::move(describe), [&] {
    call();
    return ov::VStatus(ov::VStatus::kSuccess);
  });
}

// The plug-in that registered the name as one of the kinds; empty if none.
std::string pluginOf(std::initializer_list<const char *> kinds, const std::string &name);

// Whether a loaded plug-in registered the name as one of the kinds (the
// registering members without "register": "Command", "Data", ...).
inline bool isRegistered(std::initializer_list<const char *> kinds, const std::string &name) {
  return !pluginOf(kinds, name).empty();
}

}  // namespace host
}  // namespace standin
