// VPointArray and VVectorArray: arrays of points and of vectors.
#include <openvorla/VPointArray.h>
#include <openvorla/VVectorArray.h>

#include "ArrayLength.h"

OPENVORLA_NAMESPACE_OPEN

// The two arrays differ only in their element type.
#define GEOMETRY_ARRAY(Class, T)                                                                \
  Class::Class() = default;                                                                     \
  Class::Class(unsigned int length, const T &initialValue)                                      \
      : fElements(standin::checkedLength(length), initialValue) {}                              \
  Class::Class(const Class &other) = default;                                                   \
  Class::~Class() = default;                                                                    \
  Class &Class::operator=(const Class &other) = default;                                        \
  const T &Class::operator[](unsigned int index) const { return fElements[index]; }             \
  T &Class::operator[](unsigned int index) { return fElements[index]; }                         \
  VStatus Class::set(const T &element, unsigned int index) {                                    \
    if (index >= fElements.size()) return VStatus::kInvalidParameter;                           \
    fElements[index] = element;                                                                 \
    return VStatus::kSuccess;                                                                   \
  }                                                                                             \
  VStatus Class::append(const T &element) {                                                     \
    fElements.push_back(element);                                                               \
    return VStatus::kSuccess;                                                                   \
  }                                                                                             \
  VStatus Class::remove(unsigned int index) {                                                   \
    if (index >= fElements.size()) return VStatus::kInvalidParameter;                           \
    fElements.erase(fElements.begin() + index);                                                 \
    return VStatus::kSuccess;                                                                   \
  }                                                                                             \
  VStatus Class::clear() {                                                                      \
    fElements.clear();                                                                          \
    return VStatus::kSuccess;                                                                   \
  }                                                                                             \
  VStatus Class::setLength(unsigned int length) {                                               \
    if (length > standin::kMaxArrayLength) return VStatus::kInsufficientMemory;                 \
    fElements.resize(length, T());                                                              \
    return VStatus::kSuccess;                                                                   \
  }                                                                                             \
  unsigned int Class::length() const { return static_cast<unsigned int>(fElements.size()); }    \
  bool Class::operator==(const Class &other) const { return fElements == other.fElements; }     \
  bool Class::operator!=(const Class &other) const { return fElements != other.fElements; }

GEOMETRY_ARRAY(VPointArray, VPoint)
GEOMETRY_ARRAY(VVectorArray, VVector)

#undef GEOMETRY_ARRAY

OPENVORLA_NAMESPACE_CLOSE
