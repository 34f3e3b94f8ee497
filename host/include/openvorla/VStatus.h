// Host status: a code, an optional host message and a success flag, in three bytes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VStatus {
public:
  enum VStatusCode {
    kSuccess = 0,
    kFailure,
    kInsufficientMemory,
    kInvalidParameter,
    kLicenseFailure,
    kUnknownParameter,
    kNotImplemented,
    kNotFound,
    kEndOfFile
  };

  VStatus();
  VStatus(VStatusCode code);
  // Records the message so that errorString() returns exactly this text.
  VStatus(VStatusCode code, const VString &message);

  VStatusCode statusCode() const;
  bool error() const;
  explicit operator bool() const;  // true on success
  // Statuses compare by their code alone.
  bool operator==(const VStatus &other) const;
  bool operator==(VStatusCode code) const;
  bool operator!=(const VStatus &other) const;
  bool operator!=(VStatusCode code) const;

  // The recorded message, or the standard text of the code.
  VString errorString() const;
  void clear();
  // Writes "<prefix>: <errorString()>" to the application log.
  void perror(const char *prefix) const;

private:
  unsigned char fStatusCode;
  unsigned char fInternalStatusCode;  // index of the recorded message, 0xFF for none
  bool fSuccess;
};

OPENVORLA_NAMESPACE_CLOSE
