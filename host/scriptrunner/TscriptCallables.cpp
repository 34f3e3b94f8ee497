// The scripting engine's side of plug-in callbacks: calling the script
// objects that a Python plug-in registered, and letting go of them.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>

#include <standin/ScriptCallables.h>

#include <cstring>
#include <string>
#include <unordered_map>

#include "Engine.h"

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

// The proxy classes of the package that plug-ins import, or null (no error
// set) when it is not loaded.
PyObject *proxyModule() {
  PyObject *name = PyUnicode_FromString("openvorla.OpenVorlaVPx");
  PyObject *module = name ? PyImport_GetModule(name) : nullptr;
  Py_XDECREF(name);
  PyErr_Clear();
  return module;
}

// The class's nearest base that is a proxy class of the package: the one
// whose __init__ makes the C++ object.
std::string proxyBaseOf(PyTypeObject *type, PyObject *module, const char *fallback) {
  PyObject *wanted = PyModule_GetNameObject(module);
  PyObject *mro = type->tp_mro;
  std::string found = fallback;
  for (Py_ssize_t i = 0; wanted && mro && i < PyTuple_GET_SIZE(mro); ++i) {
    auto *base = reinterpret_cast<PyTypeObject *>(PyTuple_GET_ITEM(mro, i));
    PyObject *name = PyObject_GetAttrString(reinterpret_cast<PyObject *>(base), "__module__");
    bool proxy = name && PyObject_RichCompareBool(name, wanted, Py_EQ) == 1;
    Py_XDECREF(name);
    if (proxy) {
      found = base->tp_name;
      break;
    }
  }
  Py_XDECREF(wanted);
  PyErr_Clear();
  return found;
}

std::string typeName(PyObject *object) {
  if (object == Py_None) return "None";
  const char *name = Py_TYPE(object)->tp_name;
  return std::string(std::strchr("aeiouAEIOU", name[0]) ? "an " : "a ") + name;
}

// The C++ address of the instance a creator returned, which must be of the
// plug-in class `base` as the package that plug-ins import defines it, and
// have its C++ object: its "this" converts to the address. Null with
// TypeError set when it is not so. Without the package, or a `base`, only
// the C++ object is looked for.
void *addressOf(PyObject *instance, const char *base) {
  PyObject *module = proxyModule();
  PyObject *cls = module && base ? PyObject_GetAttrString(module, base) : nullptr;
  int is = cls ? PyObject_IsInstance(instance, cls) : -1;
  Py_XDECREF(cls);
  PyErr_Clear();
  if (is == 0) {
    Py_XDECREF(module);
    PyErr_Format(PyExc_TypeError, "the creator returned %s, not a subclass of %s",
                 typeName(instance).c_str(), base);
    return nullptr;
  }
  PyObject *self = PyObject_GetAttrString(instance, "this");
  if (!self) {
    if (PyErr_ExceptionMatches(PyExc_AttributeError)) {
      PyErr_Clear();
      if (is == 1)
        PyErr_Format(PyExc_TypeError, "%s did not call %s.__init__", Py_TYPE(instance)->tp_name,
                     proxyBaseOf(Py_TYPE(instance), module, base).c_str());
      else  // without the package there is no telling what it is
        PyErr_Format(PyExc_TypeError,
                     "a creator must return an instance of a plug-in class, not '%.200s'",
                     Py_TYPE(instance)->tp_name);
    }
    Py_XDECREF(module);
    return nullptr;
  }
  Py_XDECREF(module);
  PyObject *number = PyNumber_Long(self);
  Py_DECREF(self);
  if (!number) return nullptr;
  void *address = PyLong_AsVoidPtr(number);
  Py_DECREF(number);
  if (!address && !PyErr_Occurred())
    PyErr_SetString(PyExc_ValueError, "a creator returned an instance without a C++ object");
  return address;
}

// The creator's name for a report that has no traceback to take it from,
// read with the creator's failure set aside.
std::string creatorName(PyObject *creator) {
  PendingError failure;
  PyObject *name = PyObject_GetAttrString(creator, "__qualname__");
  const char *text = name && PyUnicode_Check(name) ? PyUnicode_AsUTF8(name) : nullptr;
  std::string out = text ? text : "";
  Py_XDECREF(name);
  PyErr_Clear();
  return out;
}

void *create(PyObject *creator, const char *base) {
  TpythonLock lock;
  PendingError pending;
  void *address = nullptr;
  if (PyObject *instance = PyObject_CallNoArgs(creator)) {
    // The address is read before ownership moves, so that a failure leaves
    // the instance to Python, which frees it, rather than to nobody.
    address = addressOf(instance, base);
    if (address) {
      // Hands the C++ object to the host; the instance lives on as long as it.
      PyObject *disowned = PyObject_CallMethod(instance, "__disown__", nullptr);
      if (disowned)
        Py_DECREF(disowned);
      else
        address = nullptr;
    }
    if (address) scriptrunner::rememberInstance(address, instance);
    Py_DECREF(instance);
  }
  if (!address) scriptrunner::reportException(creatorName(creator));
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

// The C++ object of a value the script made: an instance of the sibling
// module's class `cls`, whose "this" converts to the address. Null with
// TypeError set when it is not one.
const void *valueAddress(PyObject *made, const char *cls) {
  PyObject *name = PyUnicode_FromString("openvorla.OpenVorla");
  PyObject *module = name ? PyImport_GetModule(name) : nullptr;
  Py_XDECREF(name);
  PyObject *type = module ? PyObject_GetAttrString(module, cls) : nullptr;
  Py_XDECREF(module);
  PyErr_Clear();
  PyObject *self = type && PyObject_IsInstance(made, type) == 1
                       ? PyObject_GetAttrString(made, "this")
                       : nullptr;
  Py_XDECREF(type);
  PyObject *number = self ? PyNumber_Long(self) : nullptr;
  Py_XDECREF(self);
  const void *address = number ? PyLong_AsVoidPtr(number) : nullptr;
  Py_XDECREF(number);
  PyErr_Clear();
  if (!address)
    PyErr_Format(PyExc_TypeError, "a %s creator must return a %s, not %s", cls, cls,
                 typeName(made).c_str());
  return address;
}

int value(PyObject *callable, const char *cls, void (*read)(const void *, void *),
          void *context) {
  TpythonLock lock;
  if (callable == Py_None) return 0;
  PendingError pending;
  PyObject *made = PyObject_CallNoArgs(callable);
  const void *address = made ? valueAddress(made, cls) : nullptr;
  if (address) read(address, context);
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

namespace scriptrunner {
namespace {

// Weak references by address, under the interpreter lock. Entries of dead
// instances go when the table has doubled since it was last swept.
struct Instances {
  std::unordered_map<const void *, PyObject *> byAddress;
  size_t swept = 0;
};

Instances &instances() {
  static Instances *table = new Instances;  // outlives the interpreter's last use
  return *table;
}

}  // namespace

void rememberInstance(const void *address, PyObject *instance) {
  Instances &table = instances();
  PyObject *ref = PyWeakref_NewRef(instance, nullptr);
  if (!ref) PyErr_Clear();  // a class without weak references goes unnamed
  PyObject *&slot = table.byAddress[address];
  Py_XSETREF(slot, ref);
  if (table.byAddress.size() < 2 * table.swept + 64) return;
  for (auto it = table.byAddress.begin(); it != table.byAddress.end();) {
    if (!it->second || PyWeakref_GET_OBJECT(it->second) == Py_None) {
      Py_XDECREF(it->second);
      it = table.byAddress.erase(it);
    } else {
      ++it;
    }
  }
  table.swept = table.byAddress.size();
}

PyObject *instanceAt(const void *address) {
  Instances &table = instances();
  auto it = table.byAddress.find(address);
  if (it == table.byAddress.end() || !it->second) return nullptr;
  PyObject *object = PyWeakref_GET_OBJECT(it->second);
  return object == Py_None ? nullptr : Py_NewRef(object);
}

}  // namespace scriptrunner
