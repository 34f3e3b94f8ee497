// Identifier of a string in one of the application's string-resource tables.
#pragma once

#include <basekit/Texport.h>

#include <string>

class T_EXPORT TstringId {
public:
  TstringId(const char *table, const char *key);
  ~TstringId();
  TstringId(const TstringId &) = delete;
  TstringId &operator=(const TstringId &) = delete;

  const char *table() const { return fTable.c_str(); }
  const char *key() const { return fKey.c_str(); }

  // Stand-in counters of all identifiers ever constructed and destroyed.
  static int constructedCount();
  static int destroyedCount();

private:
  std::string fTable;
  std::string fKey;
};
