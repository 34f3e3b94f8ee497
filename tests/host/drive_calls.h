// Calls of every forwarding override, for the test-host module.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

PyObject *drive_count(PyObject *self, PyObject *args);
PyObject *drive_info(PyObject *self, PyObject *arg);
PyObject *drive_call(PyObject *self, PyObject *args);
