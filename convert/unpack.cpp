// UnpackTuple: the argument-count check at the head of every tuple-taking entry point.

#include "errors.h"

namespace swigrt {
namespace {

void NullRest(PyObject **objs, Py_ssize_t from, Py_ssize_t max) {
  for (Py_ssize_t i = from; i < max; ++i) objs[i] = nullptr;
}

}  // namespace

Py_ssize_t UnpackTupleChecked(PyObject *args, const char *name, Py_ssize_t min, Py_ssize_t max,
                              PyObject **objs) {
  // The qualifier is dropped when the count is exact, so an exact count
  // reads "expected 2 arguments" on both sides. Counts print as int.
  const bool exact = min == max;
  if (!args) {
    if (min == 0 && max == 0) return 1;
    PyErr_Format(PyExc_TypeError, "%s expected %s%d arguments, got none", name,
                 exact ? "" : "at least ", static_cast<int>(min));
    return 0;
  }
  if (!PyTuple_Check(args)) {
    // A lone object may stand for a one-element argument list.
    if (min <= 1 && max >= 1) {
      objs[0] = args;
      NullRest(objs, 1, max);
      return 2;
    }
    PyErr_SetString(PyExc_SystemError, "UnpackTuple() argument list is not a tuple");
    return 0;
  }
  Py_ssize_t n = PyTuple_GET_SIZE(args);
  if (n < min) {
    PyErr_Format(PyExc_TypeError, "%s expected %s%d arguments, got %d", name,
                 exact ? "" : "at least ", static_cast<int>(min), static_cast<int>(n));
    return 0;
  }
  if (n > max) {
    PyErr_Format(PyExc_TypeError, "%s expected %s%d arguments, got %d", name,
                 exact ? "" : "at most ", static_cast<int>(max), static_cast<int>(n));
    return 0;
  }
  for (Py_ssize_t i = 0; i < n; ++i) objs[i] = PyTuple_GET_ITEM(args, i);
  NullRest(objs, n, max);
  return n + 1;
}

bool CountArgs(const char *name, Py_ssize_t min, Py_ssize_t max, Py_ssize_t nargs) {
  if (nargs >= min && nargs <= max) return true;
  const bool exact = min == max;
  if (nargs == 0)
    PyErr_Format(PyExc_TypeError, "%s expected %s%d arguments, got none", name,
                 exact ? "" : "at least ", static_cast<int>(min));
  else
    PyErr_Format(PyExc_TypeError, "%s expected %s%d arguments, got %d", name,
                 exact ? "" : nargs < min ? "at least " : "at most ",
                 static_cast<int>(nargs < min ? min : max), static_cast<int>(nargs));
  return false;
}

}  // namespace swigrt
