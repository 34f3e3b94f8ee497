// The application's graph, command, file and data engines, for the
// test-host module. Each call runs without the interpreter lock, as the
// application calls them; a failure status becomes a RuntimeError with its
// message.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

PyObject *graph_create(PyObject *self, PyObject *args);
PyObject *graph_delete(PyObject *self, PyObject *arg);
PyObject *graph_delete_plugin_nodes(PyObject *self, PyObject *arg);
PyObject *graph_clear(PyObject *self, PyObject *args);
PyObject *graph_nodes(PyObject *self, PyObject *args);
PyObject *graph_set(PyObject *self, PyObject *args);
PyObject *graph_get(PyObject *self, PyObject *arg);
PyObject *graph_connect(PyObject *self, PyObject *args);
PyObject *graph_disconnect(PyObject *self, PyObject *args);
PyObject *graph_evaluate(PyObject *self, PyObject *arg);
PyObject *graph_threads(PyObject *self, PyObject *args);
PyObject *command_run(PyObject *self, PyObject *args);
PyObject *command_undo(PyObject *self, PyObject *args);
PyObject *command_redo(PyObject *self, PyObject *args);
PyObject *command_flush(PyObject *self, PyObject *args);
PyObject *export_scene(PyObject *self, PyObject *args);
PyObject *import_scene(PyObject *self, PyObject *args);
PyObject *round_trip_data(PyObject *self, PyObject *args);
