// What the generated call of every forwarding override (drive.cpp) needs:
// the table it fills, arguments the test supplies or zeroed storage, and the
// results made into Python values.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>
#include <openvorla/VTypeId.h>

#include <cstddef>
#include <cstdint>
#include <sstream>
#include <stdexcept>
#include <string>
#include <type_traits>

#include "swigrt.h"

namespace drive {

struct Call {
  const char *cls;
  const char *name;
  const char *signature;
  PyObject *(*call)(void *object, PyObject *samples);
};

extern const Call calls[];
extern const std::size_t call_count;

// Room for an object of a class the headers only declare: its address is
// all that crosses into Python.
struct Storage {
  alignas(std::max_align_t) unsigned char bytes[512] = {};
  template <class T>
  T &as() {
    return *reinterpret_cast<T *>(bytes);
  }
};

// The object of an abstract class that the test supplies, by descriptor name.
template <class T>
T &Sample(PyObject *samples, const char *descriptor) {
  PyObject *sample = PyDict_GetItemString(samples, descriptor);
  swig_type_info *ty = swigrt::TypeQuery(descriptor);
  void *ptr = nullptr;
  if (!sample || !ty || !SWIG_IsOK(swigrt::ConvertPtr(sample, &ptr, ty, 0)) || !ptr)
    throw std::invalid_argument(std::string("no sample of ") + descriptor);
  return *static_cast<T *>(ptr);
}

using OPENVORLA_NAMESPACE::VStatus;
using OPENVORLA_NAMESPACE::VString;
using OPENVORLA_NAMESPACE::VStringArray;
using OPENVORLA_NAMESPACE::VTypeId;

inline PyObject *Out(const VStatus &status) { return PyLong_FromLong(status.statusCode()); }
inline PyObject *Out(bool value) { return PyBool_FromLong(value); }
inline PyObject *Out(const VString &text) { return PyUnicode_FromString(text.asUTF8()); }
inline PyObject *Out(const VTypeId &id) { return PyLong_FromUnsignedLong(id.id()); }
inline PyObject *Out(const char *text) {
  return text ? PyUnicode_FromString(text) : Py_NewRef(Py_None);
}
inline PyObject *Out(char *text) { return Out(static_cast<const char *>(text)); }

inline PyObject *Out(const VStringArray &array) {
  PyObject *list = PyList_New(0);
  for (unsigned int i = 0; list && i < array.length(); ++i) {
    PyObject *item = Out(array[i]);
    if (!item || PyList_Append(list, item) < 0) Py_CLEAR(list);
    Py_XDECREF(item);
  }
  return list;
}

template <class T>
std::enable_if_t<std::is_arithmetic_v<T> || std::is_enum_v<T>, PyObject *> Out(T value) {
  if constexpr (std::is_floating_point_v<T>)
    return PyFloat_FromDouble(value);
  else
    return PyLong_FromLongLong(static_cast<long long>(value));
}

inline PyObject *OutAddress(const void *ptr) {
  return PyLong_FromUnsignedLongLong(reinterpret_cast<std::uintptr_t>(ptr));
}

template <class T>
PyObject *Out(T *ptr) {
  return OutAddress(ptr);
}

// Any other value: that one came back.
template <class T>
std::enable_if_t<std::is_class_v<T>, PyObject *> Out(const T &) {
  return PyUnicode_FromString("value");
}

}  // namespace drive
