// Array of object handles.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VObjectArray {
public:
  VObjectArray();
  VObjectArray(const VObjectArray &other);
  ~VObjectArray();
  VObjectArray &operator=(const VObjectArray &other);

  // index must be below length().
  VObject operator[](unsigned int index) const;
  // kInvalidParameter when index is not below length().
  VStatus set(const VObject &element, unsigned int index);
  VStatus append(const VObject &element);
  VStatus remove(unsigned int index);
  VStatus clear();
  unsigned int length() const;

private:
  std::vector<VObject> fElements;
};

OPENVORLA_NAMESPACE_CLOSE
