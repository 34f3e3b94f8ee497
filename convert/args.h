// Conversion of wrapped-object arguments, with the argument's own message.
#pragma once

#include "errors.h"
#include "swigrt.h"

namespace swigrt {

// Converts argument `obj` to a pointer of type `ty`; on failure sets the
// exception its result code selects, with `message`, and returns false.
inline bool PointerArg(PyObject *obj, swig_type_info *ty, int flags, void **out,
                       const char *message) {
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

}  // namespace swigrt

namespace swigrt {

// The setter of a writable static variable: copies the converted value into
// `target` with T's assignment; 0 on success, 1 with the variable's error set.
template <class T>
int AssignVariable(PyObject *value, T &target, swig_type_info *ty, const char *message,
                   const char *null_message) {
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

}  // namespace swigrt
