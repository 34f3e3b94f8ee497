// What every generated forwarding override shares: references released on
// every path, the report of a Python exception through the host's scripting
// engine, the arity probe, and the conversion of the override's result.
//
// All of it runs with the interpreter lock held through the override's
// TpythonLock. A conversion that cannot be made throws the director
// type-mismatch exception, the only exception an override lets into the host.
#pragma once

#include <scriptrunner/TpythonInterpreter.h>

#include <type_traits>

#include "director.h"
#include "scalars.h"
#include "text.h"

namespace swigrt {

// Owns one reference, released when it goes out of scope.
class Ref {
 public:
  explicit Ref(PyObject *object = nullptr) : object_(object) {}
  Ref(const Ref &) = delete;
  Ref &operator=(const Ref &) = delete;
  ~Ref() { Py_XDECREF(object_); }
  PyObject *get() const { return object_; }

 private:
  PyObject *object_;
};

// Calls `name` on the director's Python instance with the argument objects.
// A protected member is open to its Python override only during the call.
// A Python exception is reported through the host's scripting engine and
// cleared; the result is then null.
inline PyObject *CallOverride(const Swig::Director *director, const char *name,
                              PyObject *const *args, size_t nargs, bool is_protected = false) {
  Ref method_name(PyUnicode_FromString(name));
  PyObject *result = nullptr;
  if (method_name.get()) {
    PyObject *stack[16];
    stack[0] = director->swig_get_self();
    for (size_t i = 0; i < nargs && i < 15; ++i) stack[i + 1] = args[i];
    if (is_protected) director->swig_set_inner(name, true);
    result = PyObject_VectorcallMethod(method_name.get(), stack,
                                       (nargs + 1) | PY_VECTORCALL_ARGUMENTS_OFFSET, nullptr);
    if (is_protected) director->swig_set_inner(name, false);
  }
  if (PyErr_Occurred()) {
    Py_CLEAR(result);
    TpythonInterpreter::interpreter().catchAndReportException();
  }
  return result;
}

// The probe of an override's signature: its positional parameter count
// (self included) and number of defaults; -1 when it is not a plain Python
// function, 255 when it takes *args or **kwargs.
void ProbeArity(PyObject *self, const char *name, int *count, int *defaults);

// Whether a Python method written for `k` C++ arguments takes this overload.
inline bool ArityAccepts(PyObject *self, const char *name, int k) {
  int count = -1, defaults = 0;
  ProbeArity(self, name, &count, &defaults);
  return count >= k + 1 && count - defaults < k + 2;
}

[[noreturn]] void RaiseUninitialized(const char *message);
[[noreturn]] void RaisePureVirtual(const char *qualified_name);
[[noreturn]] void RaiseMismatch(int code, const char *message);

// --- arguments -----------------------------------------------------------------

// A host object the override may look at during the call, never owning it.
inline PyObject *BorrowedArg(const void *object, swig_type_info *ty) {
  return NewPointerObj(nullptr, const_cast<void *>(object), ty, 0);
}

// An object of a class that may itself be a director: its own Python
// instance when it is one.
template <class T>
PyObject *DirectorArg(const T *object, swig_type_info *ty) {
  if (auto *director = dynamic_cast<const Swig::Director *>(object)) {
    if (PyObject *self = director->swig_get_self()) return Py_NewRef(self);
  }
  return BorrowedArg(object, ty);
}

// A host value passed by value: a copy that Python owns.
template <class T>
PyObject *CopiedArg(const T &value, swig_type_info *ty) {
  return NewPointerObj(nullptr, new T(value), ty, SWIG_POINTER_OWN);
}

// --- results -------------------------------------------------------------------

// A status: failure after a raising override; code 5 for the very interned
// "unknown"; success for anything else, equal strings included.
// Each test interns "unknown" anew and keeps the reference it gets.
inline StatusType StatusResult(PyObject *result) {
  if (!result) return StatusType(StatusType::kFailure);
  if ((PyUnicode_Check(result) || PyBytes_Check(result)) &&
      result == PyUnicode_InternFromString("unknown"))
    return StatusType(StatusType::kUnknownParameter);
  return StatusType(StatusType::kSuccess);
}

// Only a bool counts; anything else, and a raising override, is false.
inline bool BoolResult(PyObject *result) { return result == Py_True; }

template <class T>
T ScalarResult(PyObject *result, int (*convert)(PyObject *, T *), const char *message) {
  T value{};
  int res = result ? convert(result, &value) : SWIG_TypeError;
  if (!SWIG_IsOK(res)) RaiseMismatch(SWIG_ArgError(res), message);
  return value;
}

// A host value: the converted object copied into the result.
template <class T>
T ValueResult(PyObject *result, swig_type_info *ty, const char *message) {
  void *ptr = nullptr;
  int res = result ? ConvertPtr(result, &ptr, ty, 0) : SWIG_TypeError;
  if (!SWIG_IsOK(res) || !ptr) RaiseMismatch(SWIG_IsOK(res) ? SWIG_TypeError : SWIG_ArgError(res), message);
  T value = *static_cast<T *>(ptr);
  if (SWIG_IsNewObj(res)) delete static_cast<T *>(ptr);
  return value;
}

// An object an override hands to the host: its Python wrapper gives up its
// ownership, the returning director records it, and when it is itself a
// director it keeps its Python instance alive for as long as the host keeps
// the object, whether or not the plug-in still refers to it.
template <class T>
void HandOver(const Swig::Director *director, T *object, int own) {
  director->swig_acquire_ownership_obj(const_cast<std::remove_const_t<T> *>(object), own);
  if constexpr (std::is_polymorphic_v<T>) {
    if (Swig::Director *handed = Swig::DirectorOf(const_cast<std::remove_const_t<T> *>(object)))
      handed->swig_disown();
  }
}

// A pointer handed to the host (possibly null, for None).
template <class T>
T *PointerResult(const Swig::Director *director, PyObject *result, swig_type_info *ty,
                 const char *message) {
  void *ptr = nullptr;
  int own = 0;
  int res = result ? ConvertPtr(result, &ptr, ty, SWIG_POINTER_DISOWN, &own) : SWIG_TypeError;
  if (!SWIG_IsOK(res)) RaiseMismatch(SWIG_ArgError(res), message);
  HandOver(director, static_cast<T *>(ptr), own);
  return static_cast<T *>(ptr);
}

// A reference handed to the host: as a pointer, but null is refused.
template <class T>
T &ReferenceResult(const Swig::Director *director, PyObject *result, swig_type_info *ty,
                   const char *message, const char *null_message) {
  void *ptr = nullptr;
  int own = 0;
  int res = result ? ConvertPtr(result, &ptr, ty, SWIG_POINTER_DISOWN, &own) : SWIG_TypeError;
  if (!SWIG_IsOK(res)) RaiseMismatch(SWIG_ArgError(res), message);
  if (!ptr) RaiseMismatch(SWIG_ValueError, null_message);
  HandOver(director, static_cast<T *>(ptr), own);
  return *static_cast<T *>(ptr);
}

// Text for a `char *` result; a buffer made for it lives as long as the director.
char *CharsResult(const Swig::Director *director, PyObject *result, const char *message);

// Text and lists of text through the host's scripting engine: a result of
// the wrong kind leaves TypeError set and the host gets what was converted.
StringType StringResult(PyObject *result);
StringArrayType StringArrayResult(PyObject *result);

}  // namespace swigrt
