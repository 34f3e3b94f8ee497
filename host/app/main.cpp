// vorla: the application. It embeds Python 3.11, loads plug-ins written with
// the openvorla package, runs a host script (or the interactive prompt), and
// unloads the plug-ins.
//
// The interpreter lock: the main thread holds it only while it runs Python
// (loading a plug-in, running the script) and takes it through TpythonLock
// like every other host thread; the rest of the time the host works without
// it, so that its threads can call into plug-ins.
#include "Application.h"
#include "Session.h"

#include <scriptrunner/TpythonLock.h>

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>

namespace {

const char kSynopsis[] =
    "usage: vorla [--plugin FILE]... [--threads N] [-i] [SCRIPT [ARGS...]]\n"
    "       vorla --check PLUGIN...\n"
    "       vorla --help\n";
const char kDescription[] =
    "\n"
    "Loads each plug-in FILE (a Python file defining initializePlugin and\n"
    "uninitializePlugin), runs the host SCRIPT with sys.argv = [SCRIPT, ARGS...],\n"
    "then unloads the plug-ins. The script drives the application through the\n"
    "module 'vorla' (see help(vorla)). Each plug-in is checked as it loads, and\n"
    "what the checks find is logged as warnings. Without a SCRIPT, vorla reads\n"
    "the script from stdin, or opens Python's interactive prompt, with vorla\n"
    "imported, when stdin is a terminal. The logging module writes to the\n"
    "application's log (stderr); output is written line by line.\n"
    "\n"
    "  --plugin FILE  load a plug-in before the script; may be repeated\n"
    "  --threads N    host threads that evaluate the graph (default: one per core)\n"
    "  -i             open the interactive prompt after the script\n"
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
  bool interactive = false;
};

// False with a message for a usage error.
bool parseCommandLine(int argc, char **argv, Options &options, std::string &error) {
  options.threads = vorla::defaultThreads();
  for (int i = 1; i < argc; ++i) {
    std::string arg = argv[i];
    if (arg == "--help" || arg == "-h") {
      options.help = true;
    } else if (arg == "--check") {
      options.check = true;
    } else if (arg == "-i") {
      options.interactive = true;
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

// Puts the packages (and, as python does, the script's directory) first on
// sys.path and imports them early, so that a broken installation is found
// before any plug-in runs; sets up output and logging as the program has
// them.
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
  Py_XDECREF(module);
  PyObject *application = module ? PyImport_ImportModule("vorla") : nullptr;
  PyObject *started =
      application ? PyObject_CallMethod(application, "_start_program", nullptr) : nullptr;
  Py_XDECREF(application);
  if (!started) {
    PyErr_Print();
    std::fprintf(stderr, "vorla: cannot import openvorla and vorla from %s\n", package.c_str());
    return false;
  }
  Py_DECREF(started);
  return true;
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
  std::setvbuf(stdout, nullptr, _IOLBF, 0);  // the host's output, line by line too
  if (!startPython(options)) return 1;
  if (!preparePackage(options)) {
    Py_FinalizeEx();
    return 1;
  }
  vorla::setDefaultThreads(options.threads);
  PyThreadState *mainThread = PyEval_SaveThread();

  int status = 0;
  if (options.check) status = vorla::checkPlugins(options.plugins);
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
  if (status == 0 && !options.check) {
    TpythonLock lock;
    if (!options.script.empty()) status = vorla::runScript(options.script[0]);
    // As python: the prompt after the script with -i, or on a terminal
    // without one; otherwise the script stdin holds.
    if (options.interactive || (options.script.empty() && isatty(STDIN_FILENO)))
      status = vorla::interact();
    else if (options.script.empty())
      status = vorla::runStdin();
  }
  {
    TpythonLock lock;
    vorla::reset();
  }

  PyEval_RestoreThread(mainThread);
  if (Py_FinalizeEx() < 0 && status == 0) status = 120;
  return status;
}
