// What the parts of the scripting engine share: the instances that script
// creators made, and the report of a Python exception.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <string>

namespace scriptrunner {

// The instance a creator returned for the host's object at `address`, kept
// without keeping it alive, so that a report can name the class of the
// object the host was calling. With the interpreter lock held.
void rememberInstance(const void *address, PyObject *instance);
// A new reference to the instance, or null (no error set) if it is gone or
// was not made by a script's creator.
PyObject *instanceAt(const void *address);

// Reports the pending exception as catchAndReportException does; `where`
// names the code that ran when neither the traceback nor the host's
// operation does. With the interpreter lock held and an exception pending.
void reportException(const std::string &where);

}  // namespace scriptrunner
