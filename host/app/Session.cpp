// Running scripts, the interactive prompt and plug-in checks in the program.
#include "Session.h"

#include "Application.h"

#include <scriptrunner/TpythonLock.h>

#include <cerrno>
#include <cstdio>
#include <cstring>

namespace vorla {
namespace {

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

// The status of a run that raised: SystemExit's code, or 1 with the
// exception printed as python prints it.
int failedRun() {
  if (!PyErr_ExceptionMatches(PyExc_SystemExit)) {
    PyErr_Print();
    return 1;
  }
  PyObject *type, *value, *traceback;
  PyErr_Fetch(&type, &value, &traceback);
  PyErr_NormalizeException(&type, &value, &traceback);
  int status = exitStatus(value);
  Py_XDECREF(type);
  Py_XDECREF(value);
  Py_XDECREF(traceback);
  return status;
}

// Runs the open file as __main__ named `name`; closes it.
int runFile(FILE *fp, const char *name, bool closeIt) {
  PyObject *globals = PyModule_GetDict(PyImport_AddModule("__main__"));  // borrowed
  PyObject *file = PyUnicode_FromString(name);
  if (!file || PyDict_SetItemString(globals, "__file__", file) < 0) {
    Py_XDECREF(file);
    if (closeIt) std::fclose(fp);
    PyErr_Print();
    return 1;
  }
  Py_DECREF(file);
  PyObject *result = PyRun_FileExFlags(fp, name, Py_file_input, globals, globals, closeIt, nullptr);
  if (!result) return failedRun();
  Py_DECREF(result);
  return 0;
}

}  // namespace

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


int runScript(const std::string &file) {
  FILE *fp = std::fopen(file.c_str(), "rb");
  if (!fp) {
    std::fprintf(stderr, "vorla: cannot open script '%s': %s\n", file.c_str(),
                 std::strerror(errno));
    return 2;
  }
  return runFile(fp, file.c_str(), true);
}

int runStdin() {
  // With vorla imported, as at the prompt.
  PyObject *globals = PyModule_GetDict(PyImport_AddModule("__main__"));  // borrowed
  PyObject *package = PyImport_ImportModule("vorla");
  bool ok = package && PyDict_SetItemString(globals, "vorla", package) == 0;
  Py_XDECREF(package);
  return ok ? runFile(stdin, "<stdin>", false) : failedRun();
}

int interact() {
  PyObject *package = PyImport_ImportModule("vorla");
  PyObject *result = package ? PyObject_CallMethod(package, "_interact", nullptr) : nullptr;
  Py_XDECREF(package);
  if (!result) return failedRun();
  Py_DECREF(result);
  return 0;
}

}  // namespace vorla
