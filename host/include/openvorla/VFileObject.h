// A file named by its directory and its name. The separator is '/'.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFileObject {
public:
  VFileObject();
  VFileObject(const VFileObject &other);
  ~VFileObject();
  VFileObject &operator=(const VFileObject &other);

  // The path part ends with its separator, or is empty; a trailing separator
  // is added to a path that lacks it.
  VStatus setRawName(const VString &name);
  VStatus setRawPath(const VString &path);
  // Splits at the last separator.
  VStatus setRawFullName(const VString &fullName);
  VString rawName() const;
  VString rawPath() const;
  VString rawFullName() const;
  // The full name with a leading "~/" and the environment variables named
  // as $NAME or ${NAME} replaced by their values (unset ones by nothing).
  VString expandedFullName() const;
  // The name after its last '.', without it; "" when it has none.
  VString extension() const;
  bool isSet() const;  // a name was given

  bool operator==(const VFileObject &other) const;
  bool operator!=(const VFileObject &other) const;

private:
  VString fPath;
  VString fName;
};

OPENVORLA_NAMESPACE_CLOSE
