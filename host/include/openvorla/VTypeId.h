// Identifier of a plug-in node or data type; 0 is invalid.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VTypeId {
public:
  VTypeId();
  explicit VTypeId(unsigned int id);
  VTypeId(const VTypeId &other);
  ~VTypeId();
  VTypeId &operator=(const VTypeId &other);

  bool operator==(const VTypeId &other) const;
  bool operator!=(const VTypeId &other) const;
  unsigned int id() const;

private:
  unsigned int fId;
};

OPENVORLA_NAMESPACE_CLOSE
