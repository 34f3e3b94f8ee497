// Table of the external content that a node refers to, resolved or not: per
// key, where it was asked for, where it was found, the node it belongs to and
// the search roots used.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>

#include <memory>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VExternalContentInfoTable {
public:
  VExternalContentInfoTable();
  VExternalContentInfoTable(const VExternalContentInfoTable &) = delete;
  VExternalContentInfoTable &operator=(const VExternalContentInfoTable &) = delete;
  ~VExternalContentInfoTable();

  VStatus addResolvedEntry(const VString &key, const VString &unresolvedLocation,
                           const VString &resolvedLocation, const VStringArray &roots);
  VStatus addResolvedEntry(const VString &key, const VString &unresolvedLocation,
                           const VString &resolvedLocation, const VString &contextNodeFullName,
                           const VStringArray &roots);
  VStatus addUnresolvedEntry(const VString &key, const VString &unresolvedLocation,
                             const VStringArray &roots);
  VStatus addUnresolvedEntry(const VString &key, const VString &unresolvedLocation,
                             const VString &contextNodeFullName, const VStringArray &roots);
  unsigned int length() const;

  // Entry `index`, or kNotFound past the end; with a non-empty
  // `contextNodeFullName` the entry must also belong to that node.
  VStatus getEntry(unsigned int index, VString &key, VString &unresolvedLocation,
                   VString &resolvedLocation, VString &contextNodeFullName, VStringArray &roots,
                   const VString &requiredContext = VString()) const;
  // The entry of `key`: its key (as stored), locations, node and roots.
  VStatus getInfo(const VString &key, VString &keyFound, VString &unresolvedLocation,
                  VString &resolvedLocation, VString &contextNodeFullName, VStringArray &roots,
                  const VString &requiredContext = VString()) const;

private:
  struct Entries;
  std::unique_ptr<Entries> fEntries;
};

OPENVORLA_NAMESPACE_CLOSE
