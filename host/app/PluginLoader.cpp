// The plug-in loader: a plug-in is a Python file that defines
// initializePlugin(obj) and uninitializePlugin(obj); obj is the plug-in's
// object, which the plug-in hands to VFnPlugin to register what it provides.
#include "Application.h"

#include <basekit/Tlog.h>
#include <openvorla/VFnPlugin.h>
#include <openvorla/VObject.h>
#include <scriptrunner/TpythonInterpreter.h>
#include <standin/Graph.h>
#include <standin/Operation.h>
#include <standin/Plugins.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>

using OPENVORLA_NAMESPACE::VFnPlugin;
using OPENVORLA_NAMESPACE::VObject;
using OPENVORLA_NAMESPACE::VStatus;

namespace vorla {
namespace {

struct LoadedPlugin {
  std::string file;  // absolute
  VObject object;
  PyObject *module;  // owned
  PyObject *folder;  // owned: the entry it put on sys.path, or null
};

// The plug-in's folder goes first on sys.path while it is loaded, so that it
// can import the modules it ships beside it. New reference to the entry, or
// null when it was there already (another plug-in's or the user's).
PyObject *addFolder(const std::string &folder) {
  PyObject *path = PySys_GetObject("path");  // borrowed
  PyObject *entry = PyUnicode_DecodeFSDefault(folder.c_str());
  if (!path || !entry || PySequence_Contains(path, entry) != 0 ||
      PyList_Insert(path, 0, entry) < 0) {
    PyErr_Clear();
    Py_XDECREF(entry);
    return nullptr;
  }
  return entry;
}

void removeFolder(PyObject *entry) {
  if (!entry) return;
  PyObject *path = PySys_GetObject("path");  // borrowed
  Py_ssize_t at = path ? PySequence_Index(path, entry) : -1;
  if (at >= 0) PySequence_DelItem(path, at);
  PyErr_Clear();
  Py_DECREF(entry);
}

// Guarded by the interpreter lock, which every caller holds.
std::vector<LoadedPlugin> &loaded() {
  static std::vector<LoadedPlugin> plugins;
  return plugins;
}

// The current name: a plug-in may rename itself through VFnPlugin::setName.
std::string nameOf(VObject object) { return VFnPlugin(object).name().asUTF8(); }

void reportPythonException() { TpythonInterpreter::interpreter().catchAndReportException(); }

// Runs a step of loading or unloading the plug-in as an operation of the
// host, so that its exception is reported as the plug-in's. False when it
// failed, with ": <the exception>" in `why` when it raised one.
template <class Step>
bool runStep(const VObject &object, const char *doing, std::string *why, Step step) {
  auto describe = [&] { return standin::Operation::Description{nameOf(object), doing}; };
  standin::Doing<decltype(describe)> operation(nullptr, nullptr, describe);
  if (step()) return true;
  reportPythonException();
  if (why && !operation.failure().empty()) *why = ": " + operation.failure();
  return false;
}

// The checker's findings on the loaded plug-in, each "file:line: message",
// its own file shown as `file`. A checker that fails is reported, and its
// failure is the one finding.
std::vector<std::string> check(PyObject *module, const VObject &object, const std::string &file) {
  std::vector<std::string> findings;
  std::string why;
  bool checked = runStep(object, "checking the plug-in", &why, [&] {
    PyObject *checker = PyImport_ImportModule("openvorla.check");
    PyObject *lines = checker ? PyObject_CallMethod(checker, "check_plugin", "Oss", module,
                                                    nameOf(object).c_str(), file.c_str())
                              : nullptr;
    Py_XDECREF(checker);
    PyObject *fast = lines ? PySequence_Fast(lines, "check_plugin() returns a list") : nullptr;
    Py_XDECREF(lines);
    for (Py_ssize_t i = 0; fast && i < PySequence_Fast_GET_SIZE(fast); ++i) {
      const char *line = PyUnicode_AsUTF8(PySequence_Fast_GET_ITEM(fast, i));
      if (!line) break;
      findings.push_back(line);
    }
    Py_XDECREF(fast);
    return !PyErr_Occurred();
  });
  // Not finding anything is no pass when the checks could not look.
  if (!checked) findings.assign(1, file + ":1: the checks failed" + why);
  return findings;
}

// Executes the file as a new module, entered in sys.modules under `name` so
// that the plug-in's classes know their module. The file is compiled here
// rather than by the import system, so that a traceback starts in the
// plug-in. New reference, or null with the Python error set and sys.modules
// as it was.
PyObject *importFile(const std::string &name, const std::string &file) {
  std::ifstream in(file, std::ios::binary);
  std::string source((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
  PyObject *util = PyImport_ImportModule("importlib.util");
  PyObject *spec =
      util ? PyObject_CallMethod(util, "spec_from_file_location", "ss", name.c_str(), file.c_str())
           : nullptr;
  PyObject *module = spec ? PyObject_CallMethod(util, "module_from_spec", "O", spec) : nullptr;
  Py_XDECREF(spec);
  Py_XDECREF(util);
  PyObject *modules = PyImport_GetModuleDict();  // borrowed
  if (!module || PyDict_SetItemString(modules, name.c_str(), module) < 0) {
    Py_XDECREF(module);
    return nullptr;
  }
  PyObject *code = Py_CompileString(source.c_str(), file.c_str(), Py_file_input);
  PyObject *globals = PyModule_GetDict(module);  // borrowed
  // As the import system would: packages look for the builtins there.
  if (code && PyDict_SetItemString(globals, "__builtins__", PyEval_GetBuiltins()) < 0)
    Py_CLEAR(code);
  PyObject *done = code ? PyEval_EvalCode(code, globals, globals) : nullptr;
  Py_XDECREF(code);
  if (done) {
    Py_DECREF(done);
    return module;
  }
  PyObject *type, *value, *traceback;
  PyErr_Fetch(&type, &value, &traceback);
  if (PyDict_DelItemString(modules, name.c_str()) < 0) PyErr_Clear();
  PyErr_Restore(type, value, traceback);
  Py_DECREF(module);
  return nullptr;
}

// Calls module.<function>(obj) with the plug-in's object wrapped as an
// OpenVorla.VObject. A module without the function is an error, unless
// `optional`. False with the Python error set when the call fails.
bool callEntry(PyObject *module, const char *function, const std::string &name, bool optional) {
  if (optional && !PyObject_HasAttrString(module, function)) return true;
  PyObject *vpx = PyImport_ImportModule("openvorla.OpenVorlaVPx");
  PyObject *fnPlugin = vpx ? PyObject_GetAttrString(vpx, "VFnPlugin") : nullptr;
  Py_XDECREF(vpx);
  PyObject *object =
      fnPlugin ? PyObject_CallMethod(fnPlugin, "findPlugin", "s", name.c_str()) : nullptr;
  Py_XDECREF(fnPlugin);
  PyObject *result = object ? PyObject_CallMethod(module, function, "O", object) : nullptr;
  Py_XDECREF(object);
  Py_XDECREF(result);
  return result != nullptr;
}

void forgetModule(PyObject *module) {
  PyObject *name = PyModule_GetNameObject(module);
  PyObject *modules = PyImport_GetModuleDict();
  if (name && PyDict_GetItemWithError(modules, name) == module) PyDict_DelItem(modules, name);
  Py_XDECREF(name);
  PyErr_Clear();
  Py_DECREF(module);
}

// The host's objects that run a plug-in's code: the nodes of its types,
// found through its registrations (so before it deregisters them), and, when
// it unloads, the commands kept for undo, which may be its own.
void deleteObjectsOf(const std::string &name, bool commandsToo) {
  withoutInterpreterLock([&] {
    if (commandsToo) standin::Commands::instance().flush();
    standin::Graph::instance().deleteNodesOfPlugin(name);
    return 0;
  });
}

// Forgets the plug-in and whatever it left registered.
void forgetPlugin(const VObject &object) {
  withoutInterpreterLock([&] {
    standin::unloadPlugin(object);
    return 0;
  });
}

}  // namespace

std::string warning(const std::string &finding) {
  // "file:line: message" -> "file:line: warning: message"
  std::string::size_type colon = finding.find(": ");
  if (colon == std::string::npos) return "warning: " + finding;
  return finding.substr(0, colon + 2) + "warning: " + finding.substr(colon + 2);
}

std::string loadPlugin(const std::string &file, std::string *name,
                       std::vector<std::string> *findings) {
  namespace fs = std::filesystem;
  std::error_code error;
  fs::path path = fs::weakly_canonical(fs::absolute(file), error);
  if (error || !fs::is_regular_file(path)) return "No plug-in file '" + file + "'";
  for (const LoadedPlugin &plugin : loaded())
    if (plugin.file == path.string())
      return "The plug-in '" + nameOf(plugin.object) + "' is loaded from '" + file + "' already";

  VObject object = standin::loadPlugin(path.stem().c_str(), path.parent_path().c_str());
  *name = nameOf(object);
  PyObject *folder = addFolder(path.parent_path().string());
  PyObject *module = nullptr;
  std::string why;
  if (!runStep(object, "loading the plug-in", &why,
               [&] { return (module = importFile(*name, path.string())) != nullptr; })) {
    forgetPlugin(object);
    removeFolder(folder);
    return "The plug-in file '" + file + "' failed to import" + why;
  }
  if (!runStep(object, "loading the plug-in", &why,
               [&] { return callEntry(module, "initializePlugin", *name, false); })) {
    deleteObjectsOf(*name, false);
    forgetPlugin(object);
    forgetModule(module);
    removeFolder(folder);
    return "initializePlugin of the plug-in '" + *name + "' failed" + why;
  }
  *name = nameOf(object);
  loaded().push_back({path.string(), object, module, folder});
  std::vector<std::string> found = check(module, object, file);
  if (findings)
    *findings = std::move(found);
  else
    for (const std::string &finding : found) Tlog::write(warning(finding));
  return {};
}

std::string unloadPlugin(const std::string &name) {
  auto &plugins = loaded();
  auto it = std::find_if(plugins.begin(), plugins.end(),
                         [&](const LoadedPlugin &p) { return nameOf(p.object) == name; });
  if (it == plugins.end()) return "No plug-in named '" + name + "' is loaded";
  LoadedPlugin plugin = *it;
  plugins.erase(it);
  deleteObjectsOf(name, true);
  // A failing uninitializePlugin is reported; the plug-in goes all the same,
  // since the host takes back everything it registered.
  runStep(plugin.object, "unloading the plug-in", nullptr,
          [&] { return callEntry(plugin.module, "uninitializePlugin", name, true); });
  forgetPlugin(plugin.object);
  forgetModule(plugin.module);
  removeFolder(plugin.folder);
  return {};
}

void unloadAllPlugins() {
  while (!loaded().empty()) unloadPlugin(nameOf(loaded().back().object));
}

std::vector<std::string> loadedPlugins() {
  std::vector<std::string> names;
  for (const LoadedPlugin &plugin : loaded()) names.push_back(nameOf(plugin.object));
  return names;
}

void reset() {
  unloadAllPlugins();
  withoutInterpreterLock([] {
    standin::Commands::instance().flush();
    standin::Graph::instance().clear();
    standin::unloadAllPlugins();
    return 0;
  });
}

}  // namespace vorla
