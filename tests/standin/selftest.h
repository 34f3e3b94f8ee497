// What the self-test's sources share: the check that counts failures, and
// the groups of checks each source defines.
#pragma once

#include <string>

void check(bool ok, const char *what, const char *file, int line);
#define CHECK(cond) check(static_cast<bool>(cond), #cond, __FILE__, __LINE__)

inline bool contains(const std::string &text, const char *part) {
  return text.find(part) != std::string::npos;
}

// graph_selftest.cpp: the attribute function sets, the dependency graph with
// C++ nodes, and the command, file and data engines.
void testAttributeSets();
void testGraph();
void testEngines();
// node_selftest.cpp: the node proxy classes' defaults and the values they pass.
void testNodeClasses();

// interface_selftest.cpp: the host's defaults that keep state or check what
// they are given, in the proxy classes and their value types.
void testInterfaceDefaults();
