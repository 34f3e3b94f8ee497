// Host array of strings, kept in the scripting engine's TstringArray.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <basekit/TstringArray.h>

class TapiCast;

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VStringArray {
public:
  VStringArray();
  VStringArray(const VStringArray &other);
  ~VStringArray();
  VStringArray &operator=(const VStringArray &other);

  // index must be below length().
  VString operator[](unsigned int index) const;
  // kInvalidParameter when index is not below length().
  VStatus set(const VString &element, unsigned int index);
  VStatus append(const VString &element);
  VStatus clear();
  unsigned int length() const;

private:
  friend class ::TapiCast;
  TstringArray fArray;
};

OPENVORLA_NAMESPACE_CLOSE
