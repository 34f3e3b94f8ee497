// The host scripting module `vorla`: what a host script drives the
// application with. Plugs are named "node.attribute"; attribute values are
// numbers (floats) or strings. A failing host status raises RuntimeError with
// the host's text.
//
// Every call into the graph, the command engine or the file translators runs
// with the interpreter lock released: the host calls the plug-ins' Python code
// from whichever of its threads does the work, and that code takes the lock
// through TpythonLock as the host's own threads do.
#include "Application.h"

#include <openvorla/VFnData.h>

#include <basekit/Tlog.h>
#include <standin/Graph.h>
#include <standin/Lifetime.h>
#include <standin/Registry.h>

#include <algorithm>
#include <thread>

using OPENVORLA_NAMESPACE::VStatus;
using standin::Commands;
using standin::Files;
using standin::Graph;

namespace vorla {
namespace {

int coresToUse() {
  unsigned cores = std::thread::hardware_concurrency();
  return cores ? static_cast<int>(std::min<unsigned>(cores, kMaxThreads)) : 1;
}

int gDefaultThreads = coresToUse();

// Null with RuntimeError set for a failing status, otherwise None.
PyObject *statusResult(const VStatus &status) {
  if (status) Py_RETURN_NONE;
  PyErr_SetString(PyExc_RuntimeError, status.errorString().asUTF8());
  return nullptr;
}

PyObject *textResult(const std::string &error) {
  if (error.empty()) Py_RETURN_NONE;
  PyErr_SetString(PyExc_RuntimeError, error.c_str());
  return nullptr;
}

PyObject *str(const std::string &text) {
  return PyUnicode_DecodeUTF8(text.data(), static_cast<Py_ssize_t>(text.size()), "replace");
}

// A list made of the items, each converted by `make` (a new reference).
template <class Items, class Make>
PyObject *listOf(const Items &items, Make make) {
  PyObject *list = PyList_New(0);
  for (const auto &item : items) {
    PyObject *value = list ? make(item) : nullptr;
    if (!value || PyList_Append(list, value) < 0) {
      Py_XDECREF(value);
      Py_XDECREF(list);
      return nullptr;
    }
    Py_DECREF(value);
  }
  return list;
}

// A number of a list, or false.
bool listNumber(PyObject *item, double *out) {
  if (!PyLong_Check(item) && !PyFloat_Check(item)) return false;
  *out = PyFloat_AsDouble(item);
  return !PyErr_Occurred();
}

// A list (or tuple) of numbers, or of lists of one length of numbers.
bool toList(PyObject *object, standin::Value *value) {
  PyObject *items = PySequence_Fast(object, "");
  if (!items) return false;
  value->isList = true;
  Py_ssize_t n = PySequence_Fast_GET_SIZE(items);
  bool ok = true;
  for (Py_ssize_t i = 0; ok && i < n; ++i) {
    PyObject *item = PySequence_Fast_GET_ITEM(items, i);
    double number;
    if (listNumber(item, &number)) {
      ok = i == 0 || value->width == 0;
      value->numbers.push_back(number);
    } else if (PyList_Check(item) || PyTuple_Check(item)) {
      Py_ssize_t width = PySequence_Size(item);
      ok = width > 0 && (i == 0 || value->width == static_cast<size_t>(width));
      value->width = static_cast<size_t>(width);
      for (Py_ssize_t j = 0; ok && j < width; ++j)
        ok = listNumber(PySequence_Fast_GET_ITEM(item, j), &number) &&
             (value->numbers.push_back(number), true);
    } else {
      ok = false;
    }
  }
  Py_DECREF(items);
  return ok;
}

bool toValue(PyObject *object, standin::Value *value, const char *function) {
  if (PyUnicode_Check(object)) {
    Py_ssize_t size;
    const char *text = PyUnicode_AsUTF8AndSize(object, &size);
    if (!text) return false;
    value->isString = true;
    value->text.assign(text, static_cast<size_t>(size));
    return true;
  }
  if (PyLong_Check(object) || PyFloat_Check(object)) {  // booleans are integers
    value->number = PyFloat_AsDouble(object);
    return !PyErr_Occurred();
  }
  if ((PyList_Check(object) || PyTuple_Check(object)) && toList(object, value)) return true;
  if (!PyErr_Occurred())
    PyErr_Format(PyExc_TypeError,
                 "%s() takes a number, a string, or a list of numbers or of lists of numbers, "
                 "not '%.200s'",
                 function, Py_TYPE(object)->tp_name);
  return false;
}

PyObject *fromValue(const standin::Value &value) {
  if (!value.isList) return value.isString ? str(value.text) : PyFloat_FromDouble(value.number);
  const bool integers = value.dataType == OPENVORLA_NAMESPACE::VFnData::kIntArray;
  auto number = [integers](double n) {
    return integers ? PyLong_FromDouble(n) : PyFloat_FromDouble(n);
  };
  const size_t width = value.width ? value.width : 1;
  PyObject *list = PyList_New(0);
  for (size_t i = 0; list && i < value.numbers.size(); i += width) {
    PyObject *item;
    if (value.width) {
      item = PyList_New(static_cast<Py_ssize_t>(width));
      for (size_t j = 0; item && j < width; ++j)
        PyList_SET_ITEM(item, static_cast<Py_ssize_t>(j), number(value.numbers[i + j]));
    } else {
      item = number(value.numbers[i]);
    }
    if (!item || PyList_Append(list, item) < 0) Py_CLEAR(list);
    Py_XDECREF(item);
  }
  return list;
}

// --- plug-ins and what they registered ---

PyObject *load_plugin(PyObject *, PyObject *args) {
  const char *file;
  if (!PyArg_ParseTuple(args, "s:load_plugin", &file)) return nullptr;
  std::string name;
  std::string error = loadPlugin(file, &name);
  if (!error.empty()) return textResult(error);
  return str(name);
}

PyObject *unload_plugin(PyObject *, PyObject *args) {
  const char *name;
  if (!PyArg_ParseTuple(args, "s:unload_plugin", &name)) return nullptr;
  return textResult(unloadPlugin(name));
}

PyObject *plugins(PyObject *, PyObject *) { return listOf(loadedPlugins(), str); }

PyObject *registered(PyObject *, PyObject *) {
  return listOf(standin::registrations(), [](const standin::RegistrationInfo &r) {
    return Py_BuildValue("(sss)", r.kind.c_str(), r.name.c_str(), r.plugin.c_str());
  });
}

// The script objects the plug-in registered, for the checker: what the host
// calls them for and, for a creator, the plug-in class of what it must return.
PyObject *callbacks(PyObject *, PyObject *args) {
  const char *plugin;
  if (!PyArg_ParseTuple(args, "s:callbacks", &plugin)) return nullptr;
  PyObject *list = PyList_New(0);
  for (const standin::RegistrationInfo &r : standin::registrations()) {
    if (r.plugin != plugin) continue;
    for (const standin::RegisteredCallback &c : r.callbacks) {
      if (!c.script || !list) continue;
      PyObject *makes = c.makes.empty() ? Py_NewRef(Py_None) : str(c.makes);
      PyObject *item = makes ? Py_BuildValue("(sssON)", r.kind.c_str(), r.name.c_str(),
                                             c.role.c_str(), c.object, makes)
                             : nullptr;
      if (!item || PyList_Append(list, item) < 0) Py_CLEAR(list);
      Py_XDECREF(item);
    }
  }
  return list;
}

// --- nodes and attributes ---

PyObject *create_node(PyObject *, PyObject *args, PyObject *kwargs) {
  static const char *keywords[] = {"type", "name", nullptr};
  const char *type, *name = nullptr;
  if (!PyArg_ParseTupleAndKeywords(args, kwargs, "s|z:create_node", const_cast<char **>(keywords),
                                   &type, &name))
    return nullptr;
  std::string made;
  VStatus status = withoutInterpreterLock(
      [&] { return Graph::instance().createNode(type, name ? name : "", &made); });
  if (!status) return statusResult(status);
  return str(made);
}

PyObject *delete_node(PyObject *, PyObject *args) {
  const char *name;
  if (!PyArg_ParseTuple(args, "s:delete_node", &name)) return nullptr;
  return statusResult(withoutInterpreterLock([&] { return Graph::instance().deleteNode(name); }));
}

PyObject *nodes(PyObject *, PyObject *) {
  auto all = withoutInterpreterLock([] { return Graph::instance().nodes(); });
  return listOf(all, [](const standin::NodeInfo &node) {
    return Py_BuildValue("(ssl)", node.name.c_str(), node.type.c_str(), node.computeCount);
  });
}

PyObject *attributes(PyObject *, PyObject *args) {
  const char *name;
  if (!PyArg_ParseTuple(args, "s:attributes", &name)) return nullptr;
  auto all = withoutInterpreterLock([] { return Graph::instance().nodes(); });
  for (const standin::NodeInfo &node : all)
    if (node.name == name) return listOf(node.attributes, str);
  PyErr_Format(PyExc_RuntimeError, "No node named '%s'", name);
  return nullptr;
}

PyObject *set_attr(PyObject *, PyObject *args) {
  const char *plug;
  PyObject *object;
  standin::Value value;
  if (!PyArg_ParseTuple(args, "sO:set_attr", &plug, &object) ||
      !toValue(object, &value, "set_attr"))
    return nullptr;
  return statusResult(
      withoutInterpreterLock([&] { return Graph::instance().setAttr(plug, value); }));
}

PyObject *get_attr(PyObject *, PyObject *args) {
  const char *plug;
  if (!PyArg_ParseTuple(args, "s:get_attr", &plug)) return nullptr;
  standin::Value value;
  VStatus status = withoutInterpreterLock([&] { return Graph::instance().getAttr(plug, &value); });
  if (!status) return statusResult(status);
  return fromValue(value);
}

PyObject *connect(PyObject *, PyObject *args) {
  const char *source, *destination;
  if (!PyArg_ParseTuple(args, "ss:connect", &source, &destination)) return nullptr;
  return statusResult(
      withoutInterpreterLock([&] { return Graph::instance().connect(source, destination); }));
}

PyObject *disconnect(PyObject *, PyObject *args) {
  const char *source, *destination;
  if (!PyArg_ParseTuple(args, "ss:disconnect", &source, &destination)) return nullptr;
  return statusResult(
      withoutInterpreterLock([&] { return Graph::instance().disconnect(source, destination); }));
}

PyObject *evaluate(PyObject *, PyObject *args, PyObject *kwargs) {
  static const char *keywords[] = {"threads", nullptr};
  PyObject *given = Py_None;
  if (!PyArg_ParseTupleAndKeywords(args, kwargs, "|O:evaluate", const_cast<char **>(keywords),
                                   &given))
    return nullptr;
  long threads = gDefaultThreads;
  if (given != Py_None) {
    threads = PyLong_Check(given) ? PyLong_AsLong(given) : -1;
    if (PyErr_Occurred()) return nullptr;
    if (threads < 1 || threads > kMaxThreads) {
      PyErr_Format(PyExc_ValueError, "evaluate() takes threads=None or 1 to %d", kMaxThreads);
      return nullptr;
    }
  }
  return statusResult(withoutInterpreterLock(
      [&] { return Graph::instance().evaluate(static_cast<int>(threads)); }));
}

PyObject *evaluation_threads(PyObject *, PyObject *) {
  return listOf(Graph::instance().lastEvaluationThreads(), PyLong_FromLong);
}

// --- commands ---

// A command's result as Python values: None, a number, a string, or a list.
PyObject *fromResult(const standin::CommandResult &result) {
  using standin::CommandResult;
  auto one = [&](size_t i) -> PyObject * {
    switch (result.kind) {
      case CommandResult::kInt: return PyLong_FromDouble(result.numbers[i]);
      case CommandResult::kDouble: return PyFloat_FromDouble(result.numbers[i]);
      default: return str(result.texts[i]);
    }
  };
  if (result.kind == CommandResult::kNone) Py_RETURN_NONE;
  if (!result.isArray) return one(0);
  const size_t n = result.kind == CommandResult::kString ? result.texts.size()
                                                          : result.numbers.size();
  PyObject *list = PyList_New(static_cast<Py_ssize_t>(n));
  for (size_t i = 0; list && i < n; ++i) {
    PyObject *item = one(i);
    if (!item) Py_CLEAR(list);
    else PyList_SET_ITEM(list, static_cast<Py_ssize_t>(i), item);
  }
  return list;
}

PyObject *run_command(PyObject *, PyObject *args) {
  Py_ssize_t count = PyTuple_GET_SIZE(args);
  if (count < 1 || !PyUnicode_Check(PyTuple_GET_ITEM(args, 0))) {
    PyErr_SetString(PyExc_TypeError, "run_command() takes a command name and its arguments");
    return nullptr;
  }
  const char *name = PyUnicode_AsUTF8(PyTuple_GET_ITEM(args, 0));
  if (!name) return nullptr;
  std::vector<standin::Value> values(static_cast<size_t>(count - 1));
  for (Py_ssize_t i = 1; i < count; ++i) {
    PyObject *arg = PyTuple_GET_ITEM(args, i);
    if (!PyUnicode_Check(arg) && !PyLong_Check(arg) && !PyFloat_Check(arg)) {
      PyErr_Format(PyExc_TypeError,
                   "run_command() takes numbers and strings as the command's arguments, not "
                   "'%.200s'",
                   Py_TYPE(arg)->tp_name);
      return nullptr;
    }
    if (!toValue(arg, &values[static_cast<size_t>(i - 1)], "run_command")) return nullptr;
  }
  standin::CommandResult result;
  VStatus status =
      withoutInterpreterLock([&] { return Commands::instance().run(name, values, &result); });
  if (!status) return statusResult(status);
  return fromResult(result);
}

PyObject *undo(PyObject *, PyObject *) {
  return statusResult(withoutInterpreterLock([] { return Commands::instance().undo(); }));
}

PyObject *redo(PyObject *, PyObject *) {
  return statusResult(withoutInterpreterLock([] { return Commands::instance().redo(); }));
}

// --- files and data ---

// A translator's options: "name=value;..." text, or a dict of them (True
// and False as 1 and 0).
bool optionsText(PyObject *given, const char *function, std::string *text) {
  if (!given || given == Py_None) return true;
  if (PyUnicode_Check(given)) {
    const char *utf8 = PyUnicode_AsUTF8(given);
    if (utf8) *text = utf8;
    return utf8 != nullptr;
  }
  if (!PyDict_Check(given)) {
    PyErr_Format(PyExc_TypeError, "%s() takes options as a str or a dict, not '%.200s'", function,
                 Py_TYPE(given)->tp_name);
    return false;
  }
  Py_ssize_t at = 0;
  PyObject *key, *value;
  while (PyDict_Next(given, &at, &key, &value)) {
    PyObject *shown = PyBool_Check(value) ? PyUnicode_FromString(value == Py_True ? "1" : "0")
                                          : PyObject_Str(value);
    const char *name = PyUnicode_Check(key) ? PyUnicode_AsUTF8(key) : nullptr;
    const char *utf8 = shown ? PyUnicode_AsUTF8(shown) : nullptr;
    if (!name && !PyErr_Occurred())
      PyErr_Format(PyExc_TypeError, "%s() takes option names as str, not '%.200s'", function,
                   Py_TYPE(key)->tp_name);
    if (name && utf8) *text += std::string(text->empty() ? "" : ";") + name + "=" + utf8;
    Py_XDECREF(shown);
    if (!name || !utf8) return false;
  }
  return true;
}

// export_scene and import_scene.
PyObject *transferScene(PyObject *args, PyObject *kwargs, bool write) {
  static const char *keywords[] = {"path", "translator", "options", nullptr};
  const char *path, *translator;
  PyObject *given = nullptr;
  if (!PyArg_ParseTupleAndKeywords(args, kwargs, write ? "ss|O:export_scene" : "ss|O:import_scene",
                                   const_cast<char **>(keywords), &path, &translator, &given))
    return nullptr;
  std::string options;
  if (!optionsText(given, write ? "export_scene" : "import_scene", &options)) return nullptr;
  return statusResult(withoutInterpreterLock([&] {
    return write ? Files::exportScene(path, translator, options)
                 : Files::importScene(path, translator, options);
  }));
}

PyObject *export_scene(PyObject *, PyObject *args, PyObject *kwargs) {
  return transferScene(args, kwargs, true);
}

PyObject *import_scene(PyObject *, PyObject *args, PyObject *kwargs) {
  return transferScene(args, kwargs, false);
}

PyObject *round_trip_data(PyObject *, PyObject *args) {
  const char *type, *text;
  if (!PyArg_ParseTuple(args, "ss:round_trip_data", &type, &text)) return nullptr;
  std::string written, copied;
  VStatus status =
      withoutInterpreterLock([&] { return standin::roundTripData(type, text, &written, &copied); });
  if (!status) return statusResult(status);
  return Py_BuildValue("(NN)", str(written), str(copied));
}

// --- the application's log and its object counts ---

PyObject *log(PyObject *, PyObject *) { return listOf(Tlog::entries(), str); }

PyObject *write_log(PyObject *, PyObject *args) {
  const char *entry;
  if (!PyArg_ParseTuple(args, "s:write_log", &entry)) return nullptr;
  Tlog::write(entry);
  Py_RETURN_NONE;
}

PyObject *reset(PyObject *, PyObject *) {
  vorla::reset();
  Py_RETURN_NONE;
}

PyObject *alive(PyObject *, PyObject *args) {
  const char *cls;
  if (!PyArg_ParseTuple(args, "s:alive", &cls)) return nullptr;
  return PyLong_FromLong(standin::aliveCount(cls));
}

// The method table keeps every function as a PyCFunction; the flags tell
// CPython how to call it.
PyCFunction withKeywords(PyCFunctionWithKeywords function) {
  return reinterpret_cast<PyCFunction>(reinterpret_cast<void (*)()>(function));
}

PyMethodDef kFunctions[] = {
    {"load_plugin", load_plugin, METH_VARARGS,
     "load_plugin(path) -> name\n\nImports the plug-in file and runs its "
     "initializePlugin."},
    {"unload_plugin", unload_plugin, METH_VARARGS,
     "unload_plugin(name)\n\nDeletes the nodes of the plug-in's types, runs its "
     "uninitializePlugin\nand forgets what it registered."},
    {"plugins", plugins, METH_NOARGS, "plugins() -> [name, ...] of the loaded plug-ins"},
    {"registered", registered, METH_NOARGS,
     "registered() -> [(kind, name, plugin), ...] of every registration"},
    {"callbacks", callbacks, METH_VARARGS,
     "callbacks(plugin) -> [(kind, name, role, object, makes), ...]\n\nThe script objects "
     "the plug-in registered: 'creator', 'initializer', ...\nof each registration, and for a "
     "creator the plug-in class it must make\n('VPxNode', ...), otherwise None."},
    {"create_node", withKeywords(create_node), METH_VARARGS | METH_KEYWORDS,
     "create_node(type, name=None) -> name\n\nWithout a name: <type>1, <type>2, ..."},
    {"delete_node", delete_node, METH_VARARGS, "delete_node(name)"},
    {"nodes", nodes, METH_NOARGS, "nodes() -> [(name, type, compute_count), ...]"},
    {"attributes", attributes, METH_VARARGS,
     "attributes(node) -> [name, ...] of the node's attributes, as declared"},
    {"set_attr", set_attr, METH_VARARGS, "set_attr('node.attr', value): a number or a string"},
    {"get_attr", get_attr, METH_VARARGS,
     "get_attr('node.attr') -> float or str\n\nAn output is computed when it is dirty."},
    {"connect", connect, METH_VARARGS, "connect('node.attr', 'other.attr')"},
    {"disconnect", disconnect, METH_VARARGS, "disconnect('node.attr', 'other.attr')"},
    {"evaluate", withKeywords(evaluate), METH_VARARGS | METH_KEYWORDS,
     "evaluate(threads=None)\n\nComputes every dirty output on a pool of host threads "
     "(default: the\n--threads value)."},
    {"evaluation_threads", evaluation_threads, METH_NOARGS,
     "evaluation_threads() -> [0, 1, ...]: the host threads that computed in the last\n"
     "evaluate(), in the order they first computed"},
    {"run_command", run_command, METH_VARARGS,
     "run_command(name, *args) -> result\n\nArguments are numbers and strings, checked against "
     "the command's syntax.\nThe result is None, a number, a string, or a list of them."},
    {"undo", undo, METH_NOARGS, "undo(): undoes the last undoable command"},
    {"redo", redo, METH_NOARGS, "redo(): redoes the last undone command"},
    {"export_scene", withKeywords(export_scene), METH_VARARGS | METH_KEYWORDS,
     "export_scene(path, translator, options=None)\n\nWrites the scene with the translator. "
     "options: 'name=value;...' or a dict;\neach replaces the translator's default of that "
     "name."},
    {"import_scene", withKeywords(import_scene), METH_VARARGS | METH_KEYWORDS,
     "import_scene(path, translator, options=None)\n\nReads the file with the translator; "
     "options as for export_scene."},
    {"round_trip_data", round_trip_data, METH_VARARGS,
     "round_trip_data(type_name, text) -> (written, copied)\n\nMakes the data type, reads "
     "it from the text, copies it and writes\nboth back."},
    {"log", log, METH_NOARGS, "log() -> [entry, ...] of the application's log"},
    {"write_log", write_log, METH_VARARGS,
     "write_log(entry)\n\nWrites the entry to the application's log (stderr), where log() "
     "keeps it."},
    {"reset", reset, METH_NOARGS,
     "reset()\n\nUnloads every plug-in and deletes every node and every command kept\nfor "
     "undo: the application as it started."},
    {"alive", alive, METH_VARARGS, "alive(class_name) -> number of live host objects of the class"},
    {nullptr, nullptr, 0, nullptr}};

PyModuleDef kModule = {PyModuleDef_HEAD_INIT,
                       "vorla._host",
                       "The application's scripting interface: plug-ins, nodes, commands, files.",
                       -1,
                       kFunctions,
                       nullptr,
                       nullptr,
                       nullptr,
                       nullptr};

}  // namespace

void setDefaultThreads(int threads) { gDefaultThreads = threads; }
int defaultThreads() { return gDefaultThreads; }

PyObject *initScriptingModule() { return PyModule_Create(&kModule); }

}  // namespace vorla
