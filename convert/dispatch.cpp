// Overload dispatch reporting: the pending-TypeError test and its extension.
#include "dispatch.h"

namespace swigrt {

bool TypeErrorOccurred(PyObject *result) {
  return !result && PyErr_Occurred() && PyErr_ExceptionMatches(PyExc_TypeError);
}

void RaiseOrModifyTypeError(const char *message) {
  if (!TypeErrorOccurred(nullptr)) {
    PyErr_SetString(PyExc_TypeError, message);
    return;
  }
  PyObject *type = nullptr, *value = nullptr, *traceback = nullptr;
  PyErr_Fetch(&type, &value, &traceback);
  PyObject *extended = PyUnicode_FromFormat("%S\nAdditional information:\n%s", value, message);
  if (extended) {
    // The type and traceback stay; only the value is replaced.
    Py_XDECREF(value);
    PyErr_Restore(type, extended, traceback);
  } else {
    PyErr_Clear();
    PyErr_Restore(type, value, traceback);
  }
}

}  // namespace swigrt
