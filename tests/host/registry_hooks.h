// Registration as the application sees it, for the test-host module.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

PyObject *registrations(PyObject *self, PyObject *args);
PyObject *announcements(PyObject *self, PyObject *args);
PyObject *reset_announcements(PyObject *self, PyObject *args);
PyObject *initialize_node(PyObject *self, PyObject *arg);
PyObject *create_node(PyObject *self, PyObject *arg);
PyObject *create_command(PyObject *self, PyObject *arg);
PyObject *delete_node(PyObject *self, PyObject *arg);
PyObject *delete_command(PyObject *self, PyObject *arg);
