// Table of the external content that a node refers to, resolved or not.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VExternalContentInfoTable {
public:
  VExternalContentInfoTable();
  ~VExternalContentInfoTable();
};

OPENVORLA_NAMESPACE_CLOSE
