// Forwarding overrides: the arity probe, the director exceptions they raise,
// and the results converted through the host's scripting engine.
#include "forward.h"

namespace swigrt {

void ProbeArity(PyObject *self, const char *name, int *count, int *defaults) {
  *count = -1;
  *defaults = 0;
  if (!self) return;
  PyObject *attr = PyObject_GetAttrString(self, name);
  if (!attr) {
    PyErr_Clear();
    return;
  }
  // Only a plain Python function bound to the instance tells its signature;
  // the proxy class's own built-in methods do not, and so are not called.
  if (PyMethod_Check(attr) && PyFunction_Check(PyMethod_GET_FUNCTION(attr))) {
    PyObject *function = PyMethod_GET_FUNCTION(attr);
    auto *code = reinterpret_cast<PyCodeObject *>(PyFunction_GET_CODE(function));
    if (code->co_flags & (CO_VARARGS | CO_VARKEYWORDS)) {
      *count = *defaults = 255;
    } else {
      PyObject *values = PyFunction_GET_DEFAULTS(function);
      *count = code->co_argcount;
      *defaults = values ? static_cast<int>(PyTuple_GET_SIZE(values)) : 0;
    }
  }
  Py_DECREF(attr);
}

void RaiseUninitialized(const char *message) {
  throw Swig::DirectorException(PyExc_RuntimeError, message);
}

void RaisePureVirtual(const char *qualified_name) {
  throw Swig::DirectorPureVirtualException(qualified_name);
}

void RaiseMismatch(int code, const char *message) {
  throw Swig::DirectorTypeMismatchException(ErrorTypeFor(code), message);
}

char *CharsResult(const Swig::Director *director, PyObject *result, const char *message) {
  CharsArg text;
  int res = result ? AsCharPtr(result, &text) : SWIG_TypeError;
  if (!SWIG_IsOK(res)) RaiseMismatch(SWIG_ArgError(res), message);
  if (text.owned) {
    director->swig_acquire_ownership_array(text.ptr);
    text.owned = false;
  }
  return text.ptr;
}

StringType StringResult(PyObject *result) {
  StringType text;
  TpythonObjectWithLock value(result);
  if (!value.getValue(static_cast<Tstring &>(text)))
    PyErr_SetString(PyExc_TypeError, "Invalid Python object, expected a String or Unicode object");
  return text;
}

StringArrayType StringArrayResult(PyObject *result) {
  StringArrayType items;
  TpythonObjectWithLock value(result);
  if (!value.getValue(TapiCast::stringArray(items)))
    PyErr_SetString(PyExc_TypeError, "Expected a list of Strings or Unicode objects for argument 0");
  return items;
}

}  // namespace swigrt
