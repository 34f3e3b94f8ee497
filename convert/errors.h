// Result codes to Python exceptions, and argument-tuple unpacking.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

namespace swigrt {

PyObject *ErrorTypeFor(int code);  // borrowed exception class
void SetErrorMessage(PyObject *errtype, const char *message);
// Returns 0 with an exception set, or the number of objects placed plus one.
Py_ssize_t UnpackTuple(PyObject *args, const char *name, Py_ssize_t min, Py_ssize_t max,
                       PyObject **objs);

}  // namespace swigrt
