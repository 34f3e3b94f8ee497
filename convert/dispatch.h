// What overload dispatchers share: choosing to report, and the report.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

namespace swigrt {

// True when `result` is null and the pending error is a TypeError.
bool TypeErrorOccurred(PyObject *result);

// True when a dispatcher must report its prototypes: the candidate returned
// null with no error (it refused the count) or with a TypeError.
inline bool DispatchFailed(PyObject *result) {
  return !result && (!PyErr_Occurred() || TypeErrorOccurred(result));
}

// Appends `message` to a pending TypeError, or raises TypeError with it.
void RaiseOrModifyTypeError(const char *message);

}  // namespace swigrt
