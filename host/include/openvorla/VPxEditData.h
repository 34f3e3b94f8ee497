// Base class of plug-in data attached to edits.
//
// The host keeps the edits of a referenced scene sorted and merges equal
// ones: it compares their data through performIsEqual and performIsLessThan.
// Besides what a derived class holds, the data carries named string values
// that the host saves with the edit.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>

#include <cstddef>
#include <utility>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxEditData {
public:
  VPxEditData();
  virtual ~VPxEditData();

  virtual bool performIsEqual(const VPxEditData &other) const = 0;
  virtual bool performIsLessThan(const VPxEditData &other) const = 0;

  bool operator==(const VPxEditData &other) const;
  bool operator!=(const VPxEditData &other) const;
  bool operator<(const VPxEditData &other) const;

  // Setting a value replaces the one of that name; kInvalidParameter for an
  // empty name. The others report kNotFound for a name without a value.
  VStatus setValue(const VString &name, const VString &value);
  VString value(const VString &name, VStatus *ReturnStatus = NULL) const;
  bool hasValue(const VString &name) const;
  VStatus removeValue(const VString &name);
  // In the order the values were first set.
  VStringArray valueNames() const;
  unsigned int valueCount() const;
  static const char *className();

private:
  std::vector<std::pair<VString, VString>> fValues;
};

OPENVORLA_NAMESPACE_CLOSE
