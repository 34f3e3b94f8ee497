// Table of where each piece of a node's external content is to be found.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <memory>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VExternalContentLocationTable {
public:
  VExternalContentLocationTable();
  VExternalContentLocationTable(const VExternalContentLocationTable &) = delete;
  VExternalContentLocationTable &operator=(const VExternalContentLocationTable &) = delete;
  ~VExternalContentLocationTable();

  VStatus addEntry(const VString &key, const VString &location);
  unsigned int length() const;
  VStatus getLocation(const VString &key, VString &location) const;
  VStatus getEntry(unsigned int index, VString &key, VString &location) const;

private:
  struct Entries;
  std::unique_ptr<Entries> fEntries;
};

OPENVORLA_NAMESPACE_CLOSE
