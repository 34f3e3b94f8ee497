// Array of doubles.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VDoubleArray {
public:
  VDoubleArray();
  // length elements, each initialValue. More than 2^28 elements
  // throw std::length_error; setLength() reports kInsufficientMemory.
  VDoubleArray(unsigned int length, double initialValue = 0);
  VDoubleArray(const VDoubleArray &other);
  ~VDoubleArray();
  VDoubleArray &operator=(const VDoubleArray &other);

  // index must be below length().
  double operator[](unsigned int index) const;
  double &operator[](unsigned int index);
  // kInvalidParameter when index is not below length().
  VStatus set(double element, unsigned int index);
  VStatus append(double element);
  VStatus remove(unsigned int index);
  VStatus clear();
  // New elements are 0.
  VStatus setLength(unsigned int length);
  unsigned int length() const;

  bool operator==(const VDoubleArray &other) const;
  bool operator!=(const VDoubleArray &other) const;

private:
  std::vector<double> fElements;
};

OPENVORLA_NAMESPACE_CLOSE
