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
