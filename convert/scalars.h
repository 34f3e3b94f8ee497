// Scalar and enumeration arguments and results.
//
// Every argument routine takes a borrowed object and an output that may be
// null (a check without storing, as overload dispatchers do), returns a result
// code, and writes the output only on success. No routine leaves a Python
// error pending, except AsBool, whose caller replaces it with its message.
// The 32-bit ranges hold whatever the width of the platform's long.
#pragma once

#include <climits>
#include <cmath>

#include "errors.h"
#include "swigrt.h"

namespace swigrt {

// An error pending after the conversion fails it, whoever set it: also one
// that a string argument of the same call left (its TypeError then becomes
// this argument's OverflowError).
inline int AsLong32(PyObject *obj, long *out) {
  if (!PyLong_Check(obj)) return SWIG_TypeError;
  int overflow = 0;
  long v = PyLong_AsLongAndOverflow(obj, &overflow);
  if (overflow || PyErr_Occurred() || v < INT_MIN || v > INT_MAX) {
    PyErr_Clear();
    return SWIG_OverflowError;
  }
  *out = v;
  return SWIG_OK;
}

inline int AsUnsignedLong32(PyObject *obj, unsigned long *out) {
  if (!PyLong_Check(obj)) return SWIG_TypeError;
  unsigned long v = PyLong_AsUnsignedLong(obj);
  if (PyErr_Occurred() || v > UINT_MAX) {
    PyErr_Clear();
    return SWIG_OverflowError;
  }
  *out = v;
  return SWIG_OK;
}

inline int AsInt(PyObject *obj, int *out) {
  long v = 0;
  int res = AsLong32(obj, &v);
  if (SWIG_IsOK(res) && out) *out = static_cast<int>(v);
  return res;
}

inline int AsUnsignedInt(PyObject *obj, unsigned int *out) {
  unsigned long v = 0;
  int res = AsUnsignedLong32(obj, &v);
  if (SWIG_IsOK(res) && out) *out = static_cast<unsigned int>(v);
  return res;
}

inline int AsShort(PyObject *obj, short *out) {
  long v = 0;
  int res = AsLong32(obj, &v);
  if (!SWIG_IsOK(res)) return res;
  if (static_cast<unsigned long>(v + 32768) > 65535) return SWIG_OverflowError;
  if (out) *out = static_cast<short>(v);
  return SWIG_OK;
}

inline int AsUnsignedChar(PyObject *obj, unsigned char *out) {
  unsigned long v = 0;
  int res = AsUnsignedLong32(obj, &v);
  if (!SWIG_IsOK(res)) return res;
  if (v > 255) return SWIG_OverflowError;
  if (out) *out = static_cast<unsigned char>(v);
  return SWIG_OK;
}

// A string of at most one UTF-8 byte, else an integer in -128..127.
inline int AsChar(PyObject *obj, char *out) {
  if (PyUnicode_Check(obj)) {
    Py_ssize_t len = 0;
    const char *bytes = PyUnicode_AsUTF8AndSize(obj, &len);
    if (!bytes) {
      PyErr_Clear();
      return SWIG_TypeError;
    }
    if (len > 1) return SWIG_TypeError;
    if (out) *out = len ? bytes[0] : 0;
    return SWIG_OK;
  }
  long v = 0;
  int res = AsLong32(obj, &v);
  if (!SWIG_IsOK(res)) return res;
  if (v < -128 || v > 127) return SWIG_OverflowError;
  if (out) *out = static_cast<char>(v);
  return SWIG_OK;
}

// Any object by its truth value; only a failing truth test is refused.
inline int AsBool(PyObject *obj, bool *out) {
  int truth = PyObject_IsTrue(obj);
  if (truth < 0) return SWIG_ERROR;
  if (out) *out = truth != 0;
  return SWIG_OK;
}

inline int AsDouble(PyObject *obj, double *out) {
  double v = 0;
  if (PyFloat_Check(obj)) {
    v = PyFloat_AsDouble(obj);
  } else if (PyLong_Check(obj)) {
    v = PyLong_AsDouble(obj);
    if (PyErr_Occurred()) {
      PyErr_Clear();
      return SWIG_TypeError;  // too large for a double: a type error, not an overflow
    }
  } else {
    return SWIG_TypeError;
  }
  if (out) *out = v;
  return SWIG_OK;
}

inline int AsFloat(PyObject *obj, float *out) {
  double v = 0;
  int res = AsDouble(obj, &v);
  if (!SWIG_IsOK(res)) return res;
  // Infinities and NaN pass and narrow as they are.
  if (std::isfinite(v) && (v < -3.4028234663852886e38 || v > 3.4028234663852886e38))
    return SWIG_OverflowError;
  if (out) *out = static_cast<float>(v);
  return SWIG_OK;
}

inline PyObject *FromChar(char c) { return PyUnicode_DecodeUTF8(&c, 1, "surrogateescape"); }

// Reports a failed scalar argument with its message; true when `res` is success.
inline bool ScalarArg(int res, const char *message) {
  if (SWIG_IsOK(res)) return true;
  SetErrorMessage(ErrorTypeFor(SWIG_ArgError(res)), message);
  return false;
}

}  // namespace swigrt
