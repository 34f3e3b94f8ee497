// The scripting engine's side of plug-in callbacks: calling the script
// objects that a Python plug-in registered, and letting go of them.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>

#include <standin/ScriptCallables.h>

namespace {

// The host may call in while its caller has a Python error pending (a binding
// going on after a failed string conversion); that error is not the
// callback's, so it is set aside for the call and put back afterwards.
class PendingError {
 public:
  PendingError() { PyErr_Fetch(&fType, &fValue, &fTraceback); }
  ~PendingError() { PyErr_Restore(fType, fValue, fTraceback); }
  PendingError(const PendingError &) = delete;
  PendingError &operator=(const PendingError &) = delete;

 private:
  PyObject *fType, *fValue, *fTraceback;
};

// The class of the package that plug-ins import, or null (no error set) when
// the package is not loaded.
PyObject *packageClass(const char *module, const char *cls) {
  PyObject *name = PyUnicode_FromString(module);
  PyObject *loaded = name ? PyImport_GetModule(name) : nullptr;
  Py_XDECREF(name);
  PyObject *found = loaded ? PyObject_GetAttrString(loaded, cls) : nullptr;
  Py_XDECREF(loaded);
  if (!found) PyErr_Clear();
  return found;
}

// Whether `instance` is of the plug-in class `base`, as the package that
// plug-ins import defines it: 1 if it is, 0 with TypeError set if it is not,
// -1 when the package is not loaded and cannot tell.
int isOfBase(PyObject *instance, const char *base) {
  PyObject *cls = packageClass("openvorla.OpenVorlaVPx", base);
  if (!cls) return -1;
  int is = PyObject_IsInstance(instance, cls);
  Py_DECREF(cls);
  if (is == 0)
    PyErr_Format(PyExc_TypeError,
                 "a %s creator must return an instance of %s or of a class derived from it, "
                 "not '%.200s'",
                 base, base, Py_TYPE(instance)->tp_name);
  return is;
}

// The C++ address of a proxy instance: its "this" converts to the address.
// `derived`: the instance is known to be of a plug-in class.
void *addressOf(PyObject *instance, bool derived) {
  PyObject *self = PyObject_GetAttrString(instance, "this");
  if (!self) {
    if (PyErr_ExceptionMatches(PyExc_AttributeError)) {
      PyErr_Clear();
      if (derived)
        PyErr_Format(PyExc_TypeError,
                     "the '%.200s' instance a creator returned has no C++ object: its "
                     "__init__ must call its base class's __init__",
                     Py_TYPE(instance)->tp_name);
      else
        PyErr_Format(PyExc_TypeError,
                     "a creator must return an instance of a plug-in class, not '%.200s'",
                     Py_TYPE(instance)->tp_name);
    }
    return nullptr;
  }
  PyObject *number = PyNumber_Long(self);
  Py_DECREF(self);
  if (!number) return nullptr;
  void *address = PyLong_AsVoidPtr(number);
  Py_DECREF(number);
  if (!address && !PyErr_Occurred())
    PyErr_SetString(PyExc_ValueError, "a creator returned an instance without a C++ object");
  return address;
}

void *create(PyObject *creator, const char *base) {
  TpythonLock lock;
  PendingError pending;
  void *address = nullptr;
  if (PyObject *instance = PyObject_CallNoArgs(creator)) {
    // The address is read before ownership moves, so that a failure leaves
    // the instance to Python, which frees it, rather than to nobody.
    int derived = isOfBase(instance, base);
    if (derived != 0) address = addressOf(instance, derived == 1);
    if (address) {
      // Hands the C++ object to the host; the instance lives on as long as it.
      PyObject *disowned = PyObject_CallMethod(instance, "__disown__", nullptr);
      if (disowned)
        Py_DECREF(disowned);
      else
        address = nullptr;
    }
    Py_DECREF(instance);
  }
  if (!address) TpythonInterpreter::interpreter().catchAndReportException();
  return address;
}

bool run(PyObject *callable) {
  TpythonLock lock;
  PendingError pending;
  PyObject *result = PyObject_CallNoArgs(callable);
  if (!result) {
    TpythonInterpreter::interpreter().catchAndReportException();
    return false;
  }
  Py_DECREF(result);
  return true;
}

void release(PyObject *object) {
  if (!Py_IsInitialized()) return;  // gone with the interpreter
  TpythonLock lock;
  Py_DECREF(object);
}

void *hold() { return new TpythonLock; }
void unhold(void *held) { delete static_cast<TpythonLock *>(held); }

int value(PyObject *callable, const char *cls, void (*read)(const void *, void *),
          void *context) {
  TpythonLock lock;
  if (callable == Py_None) return 0;
  PendingError pending;
  PyObject *made = PyObject_CallNoArgs(callable);
  PyObject *type = made ? packageClass("openvorla.OpenVorla", cls) : nullptr;
  void *address = nullptr;
  if (made && (!type || PyObject_IsInstance(made, type) != 1)) {
    if (!PyErr_Occurred())
      PyErr_Format(PyExc_TypeError, "a %s creator must return a %s, not '%.200s'", cls, cls,
                   Py_TYPE(made)->tp_name);
  } else if (made) {
    address = addressOf(made, true);
  }
  if (address) read(address, context);
  Py_XDECREF(type);
  Py_XDECREF(made);
  if (address) return 1;
  TpythonInterpreter::interpreter().catchAndReportException();
  return -1;
}

const standin::ScriptCallableHooks kHooks{&create, &run, &release, &hold, &unhold, &value};

// Installed while the engine is loaded.
struct Installation {
  Installation() { standin::setScriptCallableHooks(&kHooks); }
  ~Installation() { standin::setScriptCallableHooks(nullptr); }
} gInstallation;

}  // namespace
