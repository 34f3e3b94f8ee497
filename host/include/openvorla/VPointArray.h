// Array of points.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPoint.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPointArray {
public:
  VPointArray();
  // length elements, each initialValue.
  VPointArray(unsigned int length, const VPoint &initialValue);
  VPointArray(const VPointArray &other);
  ~VPointArray();
  VPointArray &operator=(const VPointArray &other);

  // index must be below length().
  const VPoint &operator[](unsigned int index) const;
  VPoint &operator[](unsigned int index);
  // kInvalidParameter when index is not below length().
  VStatus set(const VPoint &element, unsigned int index);
  VStatus append(const VPoint &element);
  VStatus remove(unsigned int index);
  VStatus clear();
  // New elements are the origin.
  VStatus setLength(unsigned int length);
  unsigned int length() const;

  bool operator==(const VPointArray &other) const;
  bool operator!=(const VPointArray &other) const;

private:
  std::vector<VPoint> fElements;
};

OPENVORLA_NAMESPACE_CLOSE
