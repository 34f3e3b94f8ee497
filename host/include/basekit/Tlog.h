// The application log: each entry goes to stderr and is kept in memory.
#pragma once

#include <basekit/Texport.h>

#include <string>
#include <vector>

class T_EXPORT Tlog {
public:
  // Writes the entry and a newline to stderr and keeps it. Thread-safe.
  static void write(const std::string &entry);
  static std::vector<std::string> entries();
  static void clear();
};
