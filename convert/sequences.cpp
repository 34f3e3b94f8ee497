// Reading Python sequences, and the subscripts of value classes.
#include "sequences.h"

namespace swigrt {

SequenceItems::SequenceItems(PyObject *obj, Py_ssize_t max) {
  // A str is a sequence of str, each a sequence of itself: never of numbers.
  if (PyUnicode_Check(obj) || PyBytes_Check(obj) || PyByteArray_Check(obj) ||
      !PySequence_Check(obj))
    return;
  // The length first, so that a long sequence is refused before it is copied.
  Py_ssize_t n = PySequence_Size(obj);
  if (n < 0) {
    PyErr_Clear();
    return;
  }
  if (n > max) {
    code_ = SWIG_MemoryError;
    return;
  }
  fast_ = PySequence_Fast(obj, "");
  if (!fast_) {
    PyErr_Clear();
    return;
  }
  // A sequence whose length and items disagree has grown while it was read.
  if (PySequence_Fast_GET_SIZE(fast_) > max) {
    Py_CLEAR(fast_);
    code_ = SWIG_MemoryError;
  }
}

namespace {

bool IsDoubleFormat(const char *format) {
  if (!format) return false;
  if (format[0] == '@' || format[0] == '=') ++format;
#if __BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__
  else if (format[0] == '<') ++format;
#else
  else if (format[0] == '>' || format[0] == '!') ++format;
#endif
  return std::strcmp(format, "d") == 0;
}

}  // namespace

DoubleBuffer::DoubleBuffer(PyObject *obj, int rank) {
  if (!PyObject_CheckBuffer(obj) || PyBytes_Check(obj) || PyByteArray_Check(obj)) return;
  if (PyObject_GetBuffer(obj, &view_, PyBUF_C_CONTIGUOUS | PyBUF_FORMAT) < 0) {
    PyErr_Clear();
    return;
  }
  held_ = true;
  if (view_.ndim != rank || view_.itemsize != static_cast<Py_ssize_t>(sizeof(double)) ||
      !IsDoubleFormat(view_.format)) {
    PyBuffer_Release(&view_);
    held_ = false;
  }
}

bool IndexOf(PyObject *key, const char *cls, const char *what, Py_ssize_t *index) {
  if (!PyIndex_Check(key)) {
    PyErr_Format(PyExc_TypeError, "%s indices must be %s, not %.200s", cls, what,
                 Py_TYPE(key)->tp_name);
    return false;
  }
  Py_ssize_t i = PyNumber_AsSsize_t(key, PyExc_IndexError);
  if (i == -1 && PyErr_Occurred()) {
    // An index too large for any sequence is out of range, as for a list;
    // an __index__ that fails leaves the key no index at all.
    const bool large = PyErr_ExceptionMatches(PyExc_IndexError);
    PyErr_Clear();
    if (large)
      PyErr_Format(PyExc_IndexError, "%s index out of range", cls);
    else
      PyErr_Format(PyExc_TypeError, "%s indices must be %s, not %.200s", cls, what,
                   Py_TYPE(key)->tp_name);
    return false;
  }
  *index = i;
  return true;
}

bool InRange(Py_ssize_t *index, Py_ssize_t length, const char *cls) {
  Py_ssize_t i = *index < 0 ? *index + length : *index;
  if (i < 0 || i >= length) {
    PyErr_Format(PyExc_IndexError, "%s index out of range", cls);
    return false;
  }
  *index = i;
  return true;
}

bool GridIndex(PyObject *key, const Py_ssize_t *dims, int rank, const char *cls,
               const char *what, Py_ssize_t *at) {
  if (!PyTuple_Check(key) || PyTuple_GET_SIZE(key) != rank) {
    PyErr_Format(PyExc_TypeError, "%s indices must be %s, not %.200s", cls, what,
                 Py_TYPE(key)->tp_name);
    return false;
  }
  for (int k = 0; k < rank; ++k) {
    PyObject *item = PyTuple_GET_ITEM(key, k);
    if (!PyIndex_Check(item)) {
      PyErr_Format(PyExc_TypeError, "%s indices must be %s, not %.200s", cls, what,
                   Py_TYPE(key)->tp_name);
      return false;
    }
    if (!ItemIndex(item, dims[k], cls, what, at + k)) return false;
  }
  return true;
}

bool WithinBounds(std::initializer_list<unsigned long> at, const Py_ssize_t *dims,
                  const char *cls) {
  int k = 0;
  for (unsigned long i : at) {
    if (i >= static_cast<unsigned long>(dims[k++])) {
      PyErr_Format(PyExc_IndexError, "%s index out of range", cls);
      return false;
    }
  }
  return true;
}

PyObject *WithOutputs(PyObject *result, std::initializer_list<PyObject *> outputs) {
  bool failed = !result;
  for (PyObject *o : outputs) failed = failed || !o;
  if (failed) {
    Py_XDECREF(result);
    for (PyObject *o : outputs) Py_XDECREF(o);
    return nullptr;
  }
  if (result == Py_None && outputs.size() == 1) {
    Py_DECREF(result);
    return *outputs.begin();
  }
  const bool keep = result != Py_None;
  PyObject *tuple = PyTuple_New(static_cast<Py_ssize_t>(outputs.size()) + (keep ? 1 : 0));
  if (!tuple) {
    Py_DECREF(result);
    for (PyObject *o : outputs) Py_DECREF(o);
    return nullptr;
  }
  Py_ssize_t k = 0;
  if (keep)
    PyTuple_SET_ITEM(tuple, k++, result);
  else
    Py_DECREF(result);
  for (PyObject *o : outputs) PyTuple_SET_ITEM(tuple, k++, o);
  return tuple;
}

}  // namespace swigrt
