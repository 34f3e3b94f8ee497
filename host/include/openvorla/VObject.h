// Handle to a host object (node, attribute, data). Copies share the object.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFn.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VObject {
public:
  VObject();
  VObject(const VObject &other);
  ~VObject();
  VObject &operator=(const VObject &other);

  bool isNull() const;
  VFn::Type apiType() const;  // kInvalid for a null object
  // True when both handles name the same object (or both are null).
  bool operator==(const VObject &other) const;
  bool operator!=(const VObject &other) const;

private:
  struct Record;
  friend class VObjectFactory;
  Record *fRecord;
};

OPENVORLA_NAMESPACE_CLOSE
