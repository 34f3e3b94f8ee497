// Host calls of virtual operations, host deletion and the application log,
// for the test-host module.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

PyObject *host_call(PyObject *self, PyObject *args);
PyObject *host_call_threads(PyObject *self, PyObject *args);
PyObject *host_delete(PyObject *self, PyObject *args);
PyObject *log_entries(PyObject *self, PyObject *args);
PyObject *clear_log(PyObject *self, PyObject *args);
