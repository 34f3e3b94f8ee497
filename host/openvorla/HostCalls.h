// What the application's engines share when they call into plug-ins: statuses
// with readable messages, and C++ exceptions kept from crossing into the host.
#pragma once

#include <openvorla/VStatus.h>

#include <exception>
#include <initializer_list>
#include <string>

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

// Whether a loaded plug-in registered the name as one of the kinds (the
// registering members without "register": "Command", "Data", ...).
bool isRegistered(std::initializer_list<const char *> kinds, const std::string &name);

}  // namespace host
}  // namespace standin
