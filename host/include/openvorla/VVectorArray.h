// Array of vectors.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VVector.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VVectorArray {
public:
  VVectorArray();
  // length elements, each initialValue.
  VVectorArray(unsigned int length, const VVector &initialValue);
  VVectorArray(const VVectorArray &other);
  ~VVectorArray();
  VVectorArray &operator=(const VVectorArray &other);

  // index must be below length().
  const VVector &operator[](unsigned int index) const;
  VVector &operator[](unsigned int index);
  // kInvalidParameter when index is not below length().
  VStatus set(const VVector &element, unsigned int index);
  VStatus append(const VVector &element);
  VStatus remove(unsigned int index);
  VStatus clear();
  // New elements are null vectors.
  VStatus setLength(unsigned int length);
  unsigned int length() const;

  bool operator==(const VVectorArray &other) const;
  bool operator!=(const VVectorArray &other) const;

private:
  std::vector<VVector> fElements;
};

OPENVORLA_NAMESPACE_CLOSE
