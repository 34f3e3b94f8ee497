// Stand-in only: how the plug-in registry runs the script objects that a
// plug-in registered in place of C++ callbacks. The registry lives in the
// interface library, which knows nothing of Python; the scripting engine
// installs these when it is loaded.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VTypes.h>

namespace standin {

struct ScriptCallableHooks {
  // Calls the object with no arguments and takes over the instance it
  // returns, which must be of the plug-in class named `base` (the proxy
  // class the host makes the object as: "VPxNode", "VPxCommand", ...); its
  // C++ address, or null with the failure reported.
  void *(*create)(PyObject *creator, const char *base);
  // Calls the object with no arguments; false, the failure reported, if it
  // raised.
  bool (*run)(PyObject *callable);
  // Drops the reference the registry holds.
  void (*release)(PyObject *object);
  // Holds the interpreter lock for the calling thread until released, so
  // that a run of script calls (a worker's share of an evaluation) takes it
  // once; script code that lets it go (waiting, hashing, large array work)
  // still lets other threads run.
  void *(*hold)();
  void (*unhold)(void *held);
  // Calls the object with no arguments; what it returns must be an instance
  // of the value class `cls` of the openvorla package ("VSyntax"), whose C++
  // object `read` is given (with `context`) while the instance lives. 1 when
  // read; 0 when the object is None, a callback left out; -1, the failure
  // reported, when the call raised or returned something else.
  int (*value)(PyObject *callable, const char *cls, void (*read)(const void *object, void *context),
               void *context);
};

// The interpreter lock held for a run of script calls, while it lives; does
// nothing without a scripting engine.
class OPENVORLA_EXPORT ScriptsHeld {
 public:
  ScriptsHeld();
  ~ScriptsHeld();
  ScriptsHeld(const ScriptsHeld &) = delete;
  ScriptsHeld &operator=(const ScriptsHeld &) = delete;

 private:
  const ScriptCallableHooks *fHooks;
  void *fHeld;
};

// hooks must outlive their use; null uninstalls them. Without hooks, script
// callables are recorded but never called, nor released.
OPENVORLA_EXPORT void setScriptCallableHooks(const ScriptCallableHooks *hooks);

}  // namespace standin
