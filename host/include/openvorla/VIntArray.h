// Array of integers.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VIntArray {
public:
  VIntArray();
  // length elements, each initialValue. More than 2^28 elements
  // throw std::length_error; setLength() reports kInsufficientMemory.
  VIntArray(unsigned int length, int initialValue = 0);
  VIntArray(const VIntArray &other);
  ~VIntArray();
  VIntArray &operator=(const VIntArray &other);

  // index must be below length().
  int operator[](unsigned int index) const;
  int &operator[](unsigned int index);
  // kInvalidParameter when index is not below length().
  VStatus set(int element, unsigned int index);
  VStatus append(int element);
  VStatus remove(unsigned int index);
  VStatus clear();
  // New elements are 0.
  VStatus setLength(unsigned int length);
  unsigned int length() const;

  bool operator==(const VIntArray &other) const;
  bool operator!=(const VIntArray &other) const;

private:
  std::vector<int> fElements;
};

OPENVORLA_NAMESPACE_CLOSE
