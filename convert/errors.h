// Result codes to Python exceptions, and argument-tuple unpacking.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <exception>
#include <new>
#include <stdexcept>

namespace swigrt {

// A C++ exception that the host (or the module) throws ends the call with a
// Python exception instead of unwinding into the interpreter. A director
// exception has set its Python error already and keeps it. Called inside a
// handler.
void SetErrorFromException() noexcept;

// The result of a generated entry point's function try block.
inline PyObject *ExceptionResult() noexcept {
  SetErrorFromException();
  return nullptr;
}

// The same for a function written by hand, which the method table reaches
// through this.
template <PyCFunction entry>
PyObject *Safe(PyObject *self, PyObject *args) noexcept {
  try {
    return entry(self, args);
  } catch (...) {
    SetErrorFromException();
    return nullptr;
  }
}

PyObject *ErrorTypeFor(int code);  // borrowed exception class
void SetErrorMessage(PyObject *errtype, const char *message);
// Returns 0 with an exception set, or the number of objects placed plus one.
Py_ssize_t UnpackTupleChecked(PyObject *args, const char *name, Py_ssize_t min, Py_ssize_t max,
                              PyObject **objs);

// The count check of an entry point taking its arguments as an array
// (METH_FASTCALL), with UnpackTuple's messages.
bool CountArgs(const char *name, Py_ssize_t min, Py_ssize_t max, Py_ssize_t nargs);

// Such an entry point as a method table stores it (the flags tell the
// interpreter its real type).
inline PyCFunction FastEntry(PyObject *(*entry)(PyObject *, PyObject *const *, Py_ssize_t)) {
  return reinterpret_cast<PyCFunction>(reinterpret_cast<void (*)()>(entry));
}

// The common case inline: a tuple of an accepted length. Everything else,
// and every message, is UnpackTupleChecked's.
inline Py_ssize_t UnpackTuple(PyObject *args, const char *name, Py_ssize_t min, Py_ssize_t max,
                              PyObject **objs) {
  if (args && PyTuple_CheckExact(args)) {
    Py_ssize_t n = PyTuple_GET_SIZE(args);
    if (n >= min && n <= max) {
      for (Py_ssize_t i = 0; i < n; ++i) objs[i] = PyTuple_GET_ITEM(args, i);
      for (Py_ssize_t i = n; i < max; ++i) objs[i] = nullptr;
      return n + 1;
    }
  }
  return UnpackTupleChecked(args, name, min, max, objs);
}

}  // namespace swigrt
