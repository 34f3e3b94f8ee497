// Conversion of wrapped-object arguments, with the argument's own message.
#pragma once

#include "errors.h"
#include "swigrt.h"

namespace swigrt {

// The common case of an argument, inline: our own wrapped pointer of exactly
// the type asked for, bare or as a proxy instance's "this", with no error
// pending. Anything else is left to ConvertPtr, which gives the same answer
// for these and handles casts, chains, ownership and None.
inline bool DirectPointer(PyObject *obj, swig_type_info *ty, void **out) {
  PyTypeObject *const wrapper = SwigPyObjectTypeFast();
  if (Py_TYPE(obj) != wrapper) {
    // None converts (to null) with an error still pending from a string
    // argument, so it must not reach the lookup that could replace that
    // error; any other object without "this" fails conversion anyway.
    if (!ty || obj == Py_None) return false;
    PyObject *value = PyObject_GenericGetAttr(obj, ThisStringFast());
    if (!value) {
      PyErr_Clear();
      return false;
    }
    // The instance keeps its "this" alive; a value made by the lookup itself
    // is kept until the call is over.
    if (Py_REFCNT(value) == 1)
      KeepForCall(value);
    else
      Py_DECREF(value);
    if (Py_TYPE(value) != wrapper) return false;
    obj = value;
  }
  auto *sobj = reinterpret_cast<SwigPyObject *>(obj);
  if (sobj->ty != ty || !sobj->ptr) return false;
  *out = sobj->ptr;
  return true;
}

// Converts argument `obj` to a pointer of type `ty`; on failure sets the
// exception its result code selects, with `message`, and returns false.
inline bool PointerArg(PyObject *obj, swig_type_info *ty, int flags, void **out,
                       const char *message) {
  if (flags == 0 && DirectPointer(obj, ty, out)) return true;
  int res = ConvertPtr(obj, out, ty, flags);
  if (SWIG_IsOK(res)) return true;
  SetErrorMessage(ErrorTypeFor(SWIG_ArgError(res)), message);
  return false;
}

// As PointerArg, for a reference parameter: a null pointer is refused too.
inline bool ReferenceArg(PyObject *obj, swig_type_info *ty, void **out, const char *message,
                         const char *null_message) {
  if (!PointerArg(obj, ty, 0, out, message)) return false;
  if (*out) return true;
  SetErrorMessage(ErrorTypeFor(SWIG_ValueError), null_message);
  return false;
}

// The setter of a writable static variable: copies the converted value into
// `target` with T's assignment; 0 on success, 1 with the variable's error set.
template <class T>
int AssignVariable(PyObject *value, T &target, swig_type_info *ty, const char *message,
                   const char *null_message) {
  CallScope scope;
  void *argp = nullptr;
  int res = ConvertPtr(value, &argp, ty, 0);
  if (!SWIG_IsOK(res)) {
    SetErrorMessage(ErrorTypeFor(SWIG_ArgError(res)), message);
    return 1;
  }
  if (!argp) {
    SetErrorMessage(ErrorTypeFor(SWIG_ValueError), null_message);
    return 1;
  }
  target = *static_cast<T *>(argp);
  if (SWIG_IsNewObj(res)) delete static_cast<T *>(argp);
  return 0;
}

// The setter of a read-only variable.
inline int RefuseVariable(const char *message) {
  SetErrorMessage(ErrorTypeFor(SWIG_AttributeError), message);
  return 1;
}

// A Python object passed where the host expects a function pointer: the host
// is told, once per callable, just before it is handed over, and takes the
// reference added here. An absent optional callable is neither.
template <class F>
F CallableArg(PyObject *obj, void (*announce)()) {
  if (!obj) return nullptr;
  Py_INCREF(obj);
  announce();
  return reinterpret_cast<F>(obj);
}

}  // namespace swigrt
