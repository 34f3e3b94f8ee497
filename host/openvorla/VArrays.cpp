// VIntArray, VDoubleArray and VObjectArray: arrays of numbers and of objects.
#include <openvorla/VDoubleArray.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VObjectArray.h>

#include "ArrayLength.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

template <typename Vector, typename T>
VStatus setAt(Vector &v, const T &element, unsigned int index) {
  if (index >= v.size()) return VStatus::kInvalidParameter;
  v[index] = element;
  return VStatus::kSuccess;
}

template <typename Vector>
VStatus removeAt(Vector &v, unsigned int index) {
  if (index >= v.size()) return VStatus::kInvalidParameter;
  v.erase(v.begin() + index);
  return VStatus::kSuccess;
}

}  // namespace

// The number arrays differ only in their element type.
#define NUMBER_ARRAY(Class, T)                                                                   \
  Class::Class() = default;                                                                      \
  Class::Class(unsigned int length, T initialValue)                                              \
      : fElements(standin::checkedLength(length), initialValue) {}                                 \
  Class::Class(const Class &other) = default;                                                    \
  Class::~Class() = default;                                                                     \
  Class &Class::operator=(const Class &other) = default;                                         \
  T Class::operator[](unsigned int index) const { return fElements[index]; }                     \
  T &Class::operator[](unsigned int index) { return fElements[index]; }                          \
  VStatus Class::set(T element, unsigned int index) { return setAt(fElements, element, index); } \
  VStatus Class::append(T element) {                                                             \
    fElements.push_back(element);                                                                \
    return VStatus::kSuccess;                                                                    \
  }                                                                                              \
  VStatus Class::remove(unsigned int index) { return removeAt(fElements, index); }               \
  VStatus Class::clear() {                                                                       \
    fElements.clear();                                                                           \
    return VStatus::kSuccess;                                                                    \
  }                                                                                              \
  VStatus Class::setLength(unsigned int length) {                                                \
    if (length > standin::kMaxArrayLength) return VStatus::kInsufficientMemory;                                \
    fElements.resize(length, T());                                                               \
    return VStatus::kSuccess;                                                                    \
  }                                                                                              \
  unsigned int Class::length() const { return static_cast<unsigned int>(fElements.size()); }     \
  bool Class::operator==(const Class &other) const { return fElements == other.fElements; }      \
  bool Class::operator!=(const Class &other) const { return fElements != other.fElements; }

NUMBER_ARRAY(VIntArray, int)
NUMBER_ARRAY(VDoubleArray, double)

#undef NUMBER_ARRAY

VObjectArray::VObjectArray() = default;
VObjectArray::VObjectArray(const VObjectArray &other) = default;
VObjectArray::~VObjectArray() = default;
VObjectArray &VObjectArray::operator=(const VObjectArray &other) = default;

VObject VObjectArray::operator[](unsigned int index) const { return fElements[index]; }

VStatus VObjectArray::set(const VObject &element, unsigned int index) {
  return setAt(fElements, element, index);
}

VStatus VObjectArray::append(const VObject &element) {
  fElements.push_back(element);
  return VStatus::kSuccess;
}

VStatus VObjectArray::remove(unsigned int index) { return removeAt(fElements, index); }

VStatus VObjectArray::clear() {
  fElements.clear();
  return VStatus::kSuccess;
}

unsigned int VObjectArray::length() const { return static_cast<unsigned int>(fElements.size()); }

OPENVORLA_NAMESPACE_CLOSE
