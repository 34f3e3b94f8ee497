// What the parts of the application `vorla` share: the plug-in loader, the
// host scripting module and the way host work runs without Python. They
// live in a library of their own (libvorlaapp), which the program links and
// which the extension module vorla._host loads into a plain Python process:
// a script, and so a test, drives the same application in either.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <string>
#include <vector>

namespace vorla {

// Plug-ins. Every function needs the interpreter lock held by its caller.
// A Python exception raised by the plug-in's file, initializePlugin or
// uninitializePlugin is reported through the application's exception
// reporter (with its traceback, in the log); the failure itself comes back
// as a short text, empty on success.

// Imports the file as a module named after it, makes the plug-in's object and
// runs the module's initializePlugin with it. `name` receives the plug-in's
// name (the file's stem, made unique among loaded plug-ins). The loaded
// plug-in is checked (openvorla.check): its findings, each "file:line:
// message", go to `findings`, or without it to the log as warnings. The
// failure text ends with the Python exception that caused it, if one did.
std::string loadPlugin(const std::string &file, std::string *name,
                       std::vector<std::string> *findings = nullptr);
// A finding as a warning of the log: "file:line: warning: message".
std::string warning(const std::string &finding);
// Deletes the nodes of the plug-in's types and the commands kept for undo,
// runs uninitializePlugin, and forgets everything the plug-in registered.
std::string unloadPlugin(const std::string &name);
// Unloads every plug-in, the last loaded first.
void unloadAllPlugins();
// The loaded plug-ins' names, in load order.
std::vector<std::string> loadedPlugins();

// Unloads every plug-in and deletes every node and every command kept for
// undo: the application as it started. Needs the interpreter lock.
void reset();

// The host scripting module vorla._host, which the package vorla exports.
PyObject *initScriptingModule();
// The most host threads that may evaluate the graph.
constexpr int kMaxThreads = 256;
// What `vorla.evaluate()` uses without an argument: the --threads value,
// one per core (at most kMaxThreads) until it is set.
void setDefaultThreads(int threads);
int defaultThreads();

// Runs host work with the interpreter lock released, so that the host's
// threads can call into Python meanwhile (each takes the lock through
// TpythonLock); the lock is held again when the work returns.
template <class Work>
auto withoutInterpreterLock(Work &&work) {
  PyThreadState *state = PyEval_SaveThread();
  auto result = work();
  PyEval_RestoreThread(state);
  return result;
}

}  // namespace vorla
