// Scalar arguments of a module whose scalars are strict.
//
// A boolean is True or False (or numpy's boolean), never whatever has a truth
// value: a list given where a flag is expected is a mistake to report, not a
// flag to set. A number is what Python's number protocols make one of, as
// `math.sin` takes it: int and float, and anything with __index__ (numpy's
// integers) or __float__ (numpy's other floats, Decimal). A sequence is not a
// number, even one that would make one of itself (a numpy array of one), and
// neither is a complex number.
//
// The routines have the contract of those in scalars.h: a borrowed object, an
// output that may be null, a result code, no Python error left pending.
#pragma once

#include <cstring>

#include "scalars.h"

namespace swigrt {

inline int AsStrictBool(PyObject *obj, bool *out) {
  if (obj != Py_True && obj != Py_False) {
    const char *name = Py_TYPE(obj)->tp_name;
    if (std::strcmp(name, "numpy.bool_") != 0 && std::strcmp(name, "numpy.bool") != 0)
      return SWIG_TypeError;
  }
  int truth = PyObject_IsTrue(obj);
  if (truth < 0) {
    PyErr_Clear();
    return SWIG_TypeError;
  }
  if (out) *out = truth != 0;
  return SWIG_OK;
}

// An int as `exact` takes it, or the int that __index__ makes.
template <class T>
int AsIndexed(PyObject *obj, T *out, int (*exact)(PyObject *, T *)) {
  if (PyLong_Check(obj)) return exact(obj, out);
  if (!PyIndex_Check(obj)) return SWIG_TypeError;
  PyObject *index = PyNumber_Index(obj);
  if (!index) {
    PyErr_Clear();
    return SWIG_TypeError;
  }
  int res = exact(index, out);
  Py_DECREF(index);
  return res;
}

inline int AsNumberInt(PyObject *obj, int *out) { return AsIndexed(obj, out, AsInt); }
inline int AsNumberUnsignedInt(PyObject *obj, unsigned int *out) {
  return AsIndexed(obj, out, AsUnsignedInt);
}
inline int AsNumberShort(PyObject *obj, short *out) { return AsIndexed(obj, out, AsShort); }
inline int AsNumberUnsignedChar(PyObject *obj, unsigned char *out) {
  return AsIndexed(obj, out, AsUnsignedChar);
}

inline int AsNumberDouble(PyObject *obj, double *out) {
  if (PyFloat_CheckExact(obj)) {
    if (out) *out = PyFloat_AS_DOUBLE(obj);
    return SWIG_OK;
  }
  if (PyFloat_Check(obj) || PyLong_Check(obj)) return AsDouble(obj, out);
  if (PyIndex_Check(obj)) return AsIndexed(obj, out, AsDouble);
  PyNumberMethods *nb = Py_TYPE(obj)->tp_as_number;
  if (!nb || !nb->nb_float || PySequence_Check(obj) || PyComplex_Check(obj))
    return SWIG_TypeError;
  double v = PyFloat_AsDouble(obj);
  if (v == -1.0 && PyErr_Occurred()) {
    PyErr_Clear();
    return SWIG_TypeError;
  }
  if (out) *out = v;
  return SWIG_OK;
}

inline int AsNumberFloat(PyObject *obj, float *out) {
  double v = 0;
  int res = AsNumberDouble(obj, &v);
  if (!SWIG_IsOK(res)) return res;
  if (std::isfinite(v) && (v < -3.4028234663852886e38 || v > 3.4028234663852886e38))
    return SWIG_OverflowError;
  if (out) *out = static_cast<float>(v);
  return SWIG_OK;
}

}  // namespace swigrt
