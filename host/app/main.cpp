// vorla: the application. It embeds Python 3.11, loads plug-ins written with
// the openvorla package, runs a host script, and unloads the plug-ins.
//
// The interpreter lock: the main thread holds it only while it runs Python
// (loading a plug-in, running the script) and takes it through TpythonLock
// like every other host thread; the rest of the time the host works without
// it, so that its threads can call into plug-ins.
#include "Application.h"

#include <scriptrunner/TpythonLock.h>
#include <standin/Graph.h>
#include <standin/Plugins.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <thread>

namespace {

const char kSynopsis[] =
    "usage: vorla [--plugin FILE]... [--threads N] [SCRIPT [ARGS...]]\n"
    "       vorla --check PLUGIN...\n"
    "       vorla --help\n";
const char kDescription[] =
    "\n"
    "Loads each plug-in FILE (a Python file defining initializePlugin and\n"
    "uninitializePlugin), runs the host SCRIPT with sys.argv = [SCRIPT, ARGS...],\n"
    "then unloads the plug-ins. The script drives the application through the\n"
    "module 'vorla' (see help(vorla)). Each plug-in is checked as it loads, and\n"
    "what the checks find is logged as warnings.\n"
    "\n"
    "  --plugin FILE  load a plug-in before the script; may be repeated\n"
    "  --threads N    host threads that evaluate the graph (default: one per core)\n"
    "  --check        load each PLUGIN alone, check it, unload it, and print what\n"
    "                 the checks find as 'file:line: message': methods whose names\n"
    "                 are near misses of an operation, operations that cannot take\n"
    "                 the application's arguments, __init__ methods that do not\n"
    "                 call their base's, classes registered under a kind whose\n"
    "                 class they do not derive from, creators that return\n"
    "                 something else than that class\n"
    "  --help         show this text\n"
    "\n"
    "Exit status: 0, or 1 when a plug-in failed to load or the script raised\n"
    "(with --check: when a plug-in failed to load or a check found anything),\n"
    "2 for a usage error.\n";

struct Options {
  std::vector<std::string> plugins;
  int threads = 0;
  std::vector<std::string> script;  // the script's path and its arguments
  bool help = false;
  bool check = false;  // the plug-ins are to be checked, and nothing run
};

// False with a message for a usage error.
bool parseCommandLine(int argc, char **argv, Options &options, std::string &error) {
  unsigned cores = std::thread::hardware_concurrency();
  options.threads = cores ? static_cast<int>(std::min<unsigned>(cores, vorla::kMaxThreads)) : 1;
  for (int i = 1; i < argc; ++i) {
    std::string arg = argv[i];
    if (arg == "--help" || arg == "-h") {
      options.help = true;
    } else if (arg == "--check") {
      options.check = true;
    } else if (arg == "--plugin" || arg == "--threads") {
      if (i + 1 == argc) {
        error = arg + " needs a value";
        return false;
      }
      const char *value = argv[++i];
      if (arg == "--plugin") {
        options.plugins.push_back(value);
        continue;
      }
      char *end;
      long threads = std::strtol(value, &end, 10);
      if (*end || end == value || threads < 1 || threads > vorla::kMaxThreads) {
        error = "--threads takes a number from 1 to " + std::to_string(vorla::kMaxThreads);
        return false;
      }
      options.threads = static_cast<int>(threads);
    } else if (arg.size() > 1 && arg[0] == '-') {
      error = "unknown option '" + arg + "'";
      return false;
    } else if (options.check) {  // no script: every file is a plug-in to check
      options.plugins.push_back(arg);
    } else {
      options.script.assign(argv + i, argv + argc);
      break;
    }
  }
  if (options.check && !options.help && options.plugins.empty()) {
    error = "--check needs a plug-in file";
    return false;
  }
  return true;
}

// The application's own directory layout: bin/vorla next to python/, which
// holds the openvorla package.
std::filesystem::path packageDirectory() {
  std::error_code error;
  std::filesystem::path exe = std::filesystem::read_symlink("/proc/self/exe", error);
  return exe.parent_path().parent_path() / "python";
}

bool failed(const PyStatus &status) {
  if (!PyStatus_Exception(status)) return false;
  std::fprintf(stderr, "vorla: cannot start Python: %s%s%s\n", status.func ? status.func : "",
               status.func ? ": " : "", status.err_msg ? status.err_msg : "");
  return true;
}

// The interpreter is Debian's, isolated from the user's environment
// (PYTHONPATH, PYTHONHOME, user site-packages) and from whichever python3
// comes first on PATH, in UTF-8 mode whatever the locale.
bool startPython(const Options &options) {
  PyPreConfig preconfig;
  PyPreConfig_InitIsolatedConfig(&preconfig);
  preconfig.utf8_mode = 1;
  if (failed(Py_PreInitialize(&preconfig))) return false;

  if (PyImport_AppendInittab("vorla", &vorla::initScriptingModule) < 0) return false;
  PyConfig config;
  PyConfig_InitIsolatedConfig(&config);
  config.install_signal_handlers = 1;  // Ctrl-C interrupts a script
  std::vector<char *> argv;
  for (const std::string &arg : options.script) argv.push_back(const_cast<char *>(arg.c_str()));
  char empty[] = "";
  if (argv.empty()) argv.push_back(empty);
  PyStatus status = PyConfig_SetBytesString(&config, &config.program_name, VORLA_PYTHON);
  if (!PyStatus_Exception(status))
    status = PyConfig_SetBytesArgv(&config, static_cast<Py_ssize_t>(argv.size()), argv.data());
  if (!PyStatus_Exception(status)) status = Py_InitializeFromConfig(&config);
  PyConfig_Clear(&config);
  return !failed(status);
}

// Puts the package (and, as python does, the script's directory) first on
// sys.path and imports the module early, so that a broken installation is
// found before any plug-in runs.
bool preparePackage(const Options &options) {
  std::filesystem::path package = packageDirectory();
  PyObject *path = PySys_GetObject("path");  // borrowed
  PyObject *dir = PyUnicode_FromString(package.c_str());
  bool ok = path && dir && PyList_Insert(path, 0, dir) == 0;
  Py_XDECREF(dir);
  if (ok && !options.script.empty()) {
    std::filesystem::path script = std::filesystem::absolute(options.script[0]);
    dir = PyUnicode_FromString(script.parent_path().c_str());
    ok = dir && PyList_Insert(path, 0, dir) == 0;
    Py_XDECREF(dir);
  }
  PyObject *module = ok ? PyImport_ImportModule("openvorla.OpenVorlaVPx") : nullptr;
  if (!module) {
    PyErr_Print();
    std::fprintf(stderr, "vorla: cannot import openvorla from %s\n", package.c_str());
    return false;
  }
  Py_DECREF(module);
  return true;
}

// Loads each plug-in alone, prints what the checks find, and unloads it. 1
// when a plug-in failed to load or the checks found anything.
int checkPlugins(const std::vector<std::string> &files) {
  int status = 0;
  for (const std::string &file : files) {
    TpythonLock lock;
    std::string name;
    std::vector<std::string> findings;
    std::string failure = vorla::loadPlugin(file, &name, &findings);
    if (!failure.empty()) {
      std::fprintf(stderr, "vorla: %s\n", failure.c_str());
      status = 1;
      continue;
    }
    for (const std::string &finding : findings) std::printf("%s\n", finding.c_str());
    std::fflush(stdout);
    if (!findings.empty()) status = 1;
    vorla::unloadPlugin(name);
  }
  return status;
}

// The exit status SystemExit asks for, printing a message it carries.
int exitStatus(PyObject *systemExit) {
  PyObject *code = PyObject_GetAttrString(systemExit, "code");
  int status = 1;
  if (!code || code == Py_None) {
    status = code ? 0 : 1;
  } else if (PyLong_Check(code)) {
    status = static_cast<int>(PyLong_AsLong(code));
  } else if (PyObject *text = PyObject_Str(code)) {
    std::fprintf(stderr, "%s\n", PyUnicode_AsUTF8(text));
    Py_DECREF(text);
  }
  Py_XDECREF(code);
  PyErr_Clear();
  return status;
}

// Runs the script as __main__. Its own exception is printed with its
// traceback as python prints it, and the status is 1.
int runScript(const std::string &file) {
  FILE *fp = std::fopen(file.c_str(), "rb");
  if (!fp) {
    std::fprintf(stderr, "vorla: cannot open script '%s': %s\n", file.c_str(),
                 std::strerror(errno));
    return 2;
  }
  PyObject *globals = PyModule_GetDict(PyImport_AddModule("__main__"));  // borrowed
  PyObject *name = PyUnicode_FromString(file.c_str());
  if (!name || PyDict_SetItemString(globals, "__file__", name) < 0) {
    Py_XDECREF(name);
    std::fclose(fp);
    PyErr_Print();
    return 1;
  }
  Py_DECREF(name);
  PyObject *result =
      PyRun_FileExFlags(fp, file.c_str(), Py_file_input, globals, globals, 1, nullptr);
  if (result) {
    Py_DECREF(result);
    return 0;
  }
  if (PyErr_ExceptionMatches(PyExc_SystemExit)) {
    PyObject *type, *value, *traceback;
    PyErr_Fetch(&type, &value, &traceback);
    PyErr_NormalizeException(&type, &value, &traceback);
    int status = exitStatus(value);
    Py_XDECREF(type);
    Py_XDECREF(value);
    Py_XDECREF(traceback);
    return status;
  }
  PyErr_Print();
  return 1;
}

}  // namespace

int main(int argc, char **argv) {
  Options options;
  std::string error;
  if (!parseCommandLine(argc, argv, options, error)) {
    std::fprintf(stderr, "vorla: %s\n%s", error.c_str(), kSynopsis);
    return 2;
  }
  if (options.help) {
    std::printf("%s%s", kSynopsis, kDescription);
    return 0;
  }
  if (!startPython(options)) return 1;
  if (!preparePackage(options)) {
    Py_FinalizeEx();
    return 1;
  }
  vorla::setDefaultThreads(options.threads);
  PyThreadState *mainThread = PyEval_SaveThread();

  int status = 0;
  if (options.check) status = checkPlugins(options.plugins);
  // A plug-in the command line names must load: without it the script would
  // run in an application that lacks what it expects.
  for (const std::string &file : options.check ? std::vector<std::string>() : options.plugins) {
    TpythonLock lock;
    std::string name;
    std::string failure = vorla::loadPlugin(file, &name);
    if (!failure.empty()) {
      std::fprintf(stderr, "vorla: %s\n", failure.c_str());
      status = 1;
      break;
    }
  }
  if (status == 0 && !options.script.empty()) {
    TpythonLock lock;
    status = runScript(options.script[0]);
  }
  {
    TpythonLock lock;
    vorla::unloadAllPlugins();
    vorla::withoutInterpreterLock([] {
      standin::Commands::instance().flush();
      standin::Graph::instance().clear();
      standin::unloadAllPlugins();
      return 0;
    });
  }

  PyEval_RestoreThread(mainThread);
  if (Py_FinalizeEx() < 0 && status == 0) status = 120;
  return status;
}
