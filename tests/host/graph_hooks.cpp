// The application's engines as a host script drives them, for tests.
#include "graph_hooks.h"

#include <standin/Graph.h>

#include <string>
#include <utility>
#include <vector>

using OPENVORLA_NAMESPACE::VStatus;
using standin::Graph;
using standin::Value;

namespace {

// Runs the call with the interpreter lock given up: compute and the other
// calls into Python nodes take it themselves, on whatever thread they run.
template <typename Call>
auto withoutLock(Call call) {
  PyThreadState *state = PyEval_SaveThread();
  auto result = call();
  PyEval_RestoreThread(state);
  return result;
}

// None, or RuntimeError with the status's message. A director exception
// caught by the host leaves its Python error behind on this thread; the
// status says the same.
PyObject *Result(const VStatus &status, PyObject *value = Py_None) {
  PyErr_Clear();
  if (!status) {
    Py_XDECREF(value == Py_None ? nullptr : value);
    PyErr_SetString(PyExc_RuntimeError, status.errorString().asUTF8());
    return nullptr;
  }
  if (value == Py_None) Py_RETURN_NONE;
  return value;
}

bool ToValue(PyObject *obj, Value *value) {
  if (PyUnicode_Check(obj)) {
    const char *text = PyUnicode_AsUTF8(obj);
    if (!text) return false;
    value->isString = true;
    value->text = text;
    return true;
  }
  value->number = PyFloat_AsDouble(obj);
  return !(value->number == -1.0 && PyErr_Occurred());
}

PyObject *FromValue(const Value &value) {
  return value.isString ? PyUnicode_FromString(value.text.c_str())
                        : PyFloat_FromDouble(value.number);
}

template <VStatus (Graph::*Member)(const std::string &, const std::string &)>
PyObject *TwoPlugs(PyObject *args) {
  const char *source, *destination;
  if (!PyArg_ParseTuple(args, "ss", &source, &destination)) return nullptr;
  return Result(withoutLock([&] { return (Graph::instance().*Member)(source, destination); }));
}

}  // namespace

// graph_create(type, name='') -> the node's name
PyObject *graph_create(PyObject *, PyObject *args) {
  const char *type, *name = "";
  if (!PyArg_ParseTuple(args, "s|s", &type, &name)) return nullptr;
  std::string made;
  VStatus status = withoutLock([&] { return Graph::instance().createNode(type, name, &made); });
  return Result(status, status ? PyUnicode_FromString(made.c_str()) : Py_None);
}

PyObject *graph_delete(PyObject *, PyObject *arg) {
  const char *name = PyUnicode_AsUTF8(arg);
  if (!name) return nullptr;
  return Result(withoutLock([&] { return Graph::instance().deleteNode(name); }));
}

PyObject *graph_delete_plugin_nodes(PyObject *, PyObject *arg) {
  const char *plugin = PyUnicode_AsUTF8(arg);
  if (!plugin) return nullptr;
  return Result(withoutLock([&] {
    Graph::instance().deleteNodesOfPlugin(plugin);
    return VStatus(VStatus::kSuccess);
  }));
}

PyObject *graph_clear(PyObject *, PyObject *) {
  return Result(withoutLock([] {
    Graph::instance().clear();
    return VStatus(VStatus::kSuccess);
  }));
}

// graph_nodes() -> [{'name', 'type', 'attributes', 'computes'}]
PyObject *graph_nodes(PyObject *, PyObject *) {
  auto nodes = withoutLock([] { return Graph::instance().nodes(); });
  PyObject *out = PyList_New(0);
  for (const standin::NodeInfo &n : nodes) {
    PyObject *attributes = PyList_New(0);
    for (const std::string &a : n.attributes) {
      PyObject *name = PyUnicode_FromString(a.c_str());
      PyList_Append(attributes, name);
      Py_DECREF(name);
    }
    PyObject *item =
        Py_BuildValue("{s:s,s:s,s:N,s:l}", "name", n.name.c_str(), "type", n.type.c_str(),
                      "attributes", attributes, "computes", n.computeCount);
    if (!item || PyList_Append(out, item) < 0) {
      Py_XDECREF(item);
      Py_DECREF(out);
      return nullptr;
    }
    Py_DECREF(item);
  }
  return out;
}

// graph_set(plug, value): a str or a number
PyObject *graph_set(PyObject *, PyObject *args) {
  const char *plug;
  PyObject *obj;
  Value value;
  if (!PyArg_ParseTuple(args, "sO", &plug, &obj) || !ToValue(obj, &value)) return nullptr;
  return Result(withoutLock([&] { return Graph::instance().setAttr(plug, value); }));
}

// graph_get(plug) -> float or str
PyObject *graph_get(PyObject *, PyObject *arg) {
  const char *plug = PyUnicode_AsUTF8(arg);
  if (!plug) return nullptr;
  Value value;
  VStatus status = withoutLock([&] { return Graph::instance().getAttr(plug, &value); });
  return Result(status, status ? FromValue(value) : Py_None);
}

PyObject *graph_connect(PyObject *, PyObject *args) { return TwoPlugs<&Graph::connect>(args); }

PyObject *graph_disconnect(PyObject *, PyObject *args) {
  return TwoPlugs<&Graph::disconnect>(args);
}

PyObject *graph_evaluate(PyObject *, PyObject *arg) {
  int threads = PyLong_AsLong(arg);
  if (threads == -1 && PyErr_Occurred()) return nullptr;
  return Result(withoutLock([&] { return Graph::instance().evaluate(threads); }));
}

PyObject *graph_threads(PyObject *, PyObject *) {
  PyObject *out = PyList_New(0);
  for (int t : Graph::instance().lastEvaluationThreads()) {
    PyObject *n = PyLong_FromLong(t);
    PyList_Append(out, n);
    Py_DECREF(n);
  }
  return out;
}

// command_run(name, *args) -> the result as text
PyObject *command_run(PyObject *, PyObject *args) {
  Py_ssize_t n = PyTuple_GET_SIZE(args);
  const char *name = n ? PyUnicode_AsUTF8(PyTuple_GET_ITEM(args, 0)) : nullptr;
  if (!name) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_TypeError, "command_run needs a command name");
    return nullptr;
  }
  std::vector<Value> values(n - 1);
  for (Py_ssize_t i = 1; i < n; ++i)
    if (!ToValue(PyTuple_GET_ITEM(args, i), &values[i - 1])) return nullptr;
  standin::CommandResult result;
  VStatus status =
      withoutLock([&] { return standin::Commands::instance().run(name, values, &result); });
  return Result(status, status ? PyUnicode_FromString(result.text().c_str()) : Py_None);
}

PyObject *command_undo(PyObject *, PyObject *) {
  return Result(withoutLock([] { return standin::Commands::instance().undo(); }));
}

PyObject *command_redo(PyObject *, PyObject *) {
  return Result(withoutLock([] { return standin::Commands::instance().redo(); }));
}

PyObject *command_flush(PyObject *, PyObject *) {
  return Result(withoutLock([] {
    standin::Commands::instance().flush();
    return VStatus(VStatus::kSuccess);
  }));
}

PyObject *export_scene(PyObject *, PyObject *args) {
  const char *path, *translator;
  if (!PyArg_ParseTuple(args, "ss", &path, &translator)) return nullptr;
  return Result(withoutLock([&] { return standin::Files::exportScene(path, translator); }));
}

PyObject *import_scene(PyObject *, PyObject *args) {
  const char *path, *translator;
  if (!PyArg_ParseTuple(args, "ss", &path, &translator)) return nullptr;
  return Result(withoutLock([&] { return standin::Files::importScene(path, translator); }));
}

// round_trip_data(type, text) -> (written, copied)
PyObject *round_trip_data(PyObject *, PyObject *args) {
  const char *type, *text;
  if (!PyArg_ParseTuple(args, "ss", &type, &text)) return nullptr;
  std::string written, copied;
  VStatus status =
      withoutLock([&] { return standin::roundTripData(type, text, &written, &copied); });
  return Result(status, status ? Py_BuildValue("(ss)", written.c_str(), copied.c_str()) : Py_None);
}
