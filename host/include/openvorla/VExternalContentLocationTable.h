// Table of the locations of the external content that a node refers to.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VExternalContentLocationTable {
public:
  VExternalContentLocationTable();
  ~VExternalContentLocationTable();
};

OPENVORLA_NAMESPACE_CLOSE
