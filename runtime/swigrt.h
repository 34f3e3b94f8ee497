// The object runtime shared by every extension module of the package: wrapped
// pointers, type descriptors and the type table shared through a capsule,
// pointer conversion, the global-variable link and module start-up helpers.
//
// The record layouts below (swig_type_info, swig_cast_info, swig_module_info,
// SwigPyClientData, SwigPyObject) are read by sibling modules through the
// shared table, so they are plain C layouts and never change shape.
//
// Each extension links its own copy of this runtime (a static library built
// with hidden visibility), so every process-wide state named here exists once
// per module, as sibling modules expect.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <cstddef>

extern "C" {

struct swig_type_info;
struct swig_cast_info;

typedef void *(*swig_converter_func)(void *, int *);
typedef swig_type_info *(*swig_dycast_func)(void **);

// One wrapped C++ type.
struct swig_type_info {
  const char *name;        // mangled name, "_p_VPxNode"
  const char *str;         // readable names separated by '|', or null
  swig_dycast_func dcast;  // null in every module of this package
  swig_cast_info *cast;    // head of the cast list
  void *clientdata;        // SwigPyClientData of the registered class, or null
  int owndata;             // 1 when the runtime made clientdata and frees it
};

// One entry of a cast list: pointers of `type` may be used as the owner type.
struct swig_cast_info {
  swig_type_info *type;
  swig_converter_func converter;  // null for the entry naming the type itself
  swig_cast_info *next;
  swig_cast_info *prev;
};

// One module's view of the shared table; modules form a circular list.
// A module defines its record statically with `types` pointing at an array
// of size + 1 null slots, `next` null, and `type_initial` / `cast_initial`
// already pointing at its own descriptors and cast arrays; InitializeModule
// fills `types` and links the record.
struct swig_module_info {
  swig_type_info **types;         // filled by InitializeModule, null-terminated
  size_t size;
  swig_module_info *next;
  swig_type_info **type_initial;  // own descriptors, ascending byte order
  swig_cast_info **cast_initial;  // per type, terminated by a null type
  void *clientdata;
};

// Per registered Python proxy class.
struct SwigPyClientData {
  PyObject *klass;
  PyObject *newraw;
  PyObject *newargs;
  PyObject *destroy;
  int delargs;
  int implicitconv;
  PyTypeObject *pytype;
};

// The Python object that carries a C++ pointer. Sibling modules read only
// the fields up to `next`; `table` is private to the module whose
// SwigPyObject type made the object.
struct SwigPyObject {
  PyObject_HEAD
  void *ptr;
  swig_type_info *ty;
  int own;
  PyObject *next;
  // A reference on the shared table's capsule, taken the first time the
  // object owns its pointer and dropped when the object dies, so that the
  // destructor named by the table stays reachable while it may be needed.
  // Kept apart from `own` because ownership can change many times.
  PyObject *table;
  // How many wrappers of this module's type have this one as their `next`;
  // 0 for the head of a chain, which therefore cannot be inside another.
  Py_ssize_t links;
};

// A copied block of bytes with its type.
struct SwigPyPacked {
  PyObject_HEAD
  void *pack;
  swig_type_info *ty;
  size_t size;
};

// A record of the constant table installed generically at start-up.
struct swig_const_info {
  int type;  // SWIG_PY_POINTER, SWIG_PY_BINARY, 0 ends the table
  const char *name;
  long lvalue;
  double dvalue;
  void *pvalue;
  swig_type_info **ptype;
};

}  // extern "C"

// Conversion and wrapping flags.
enum : int {
  SWIG_POINTER_DISOWN = 0x1,
  SWIG_POINTER_IMPLICIT_CONV = 0x2,
  SWIG_POINTER_NO_NULL = 0x4,
  SWIG_POINTER_CLEAR = 0x8,
  SWIG_POINTER_RELEASE = SWIG_POINTER_CLEAR | SWIG_POINTER_DISOWN,
  // The module's own: the wrapper found stops pointing at the object, which
  // the caller is about to delete (whether or not the wrapper owned it).
  SWIG_POINTER_FORGET = 0x10,

  SWIG_POINTER_OWN = 0x1,
  SWIG_POINTER_NOSHADOW = 0x2,
  SWIG_POINTER_NEW = SWIG_POINTER_NOSHADOW | SWIG_POINTER_OWN,

  SWIG_CAST_NEW_MEMORY = 0x2,
  SWIG_NEWOBJMASK = 0x200,

  SWIG_PY_POINTER = 4,
  SWIG_PY_BINARY = 5,
};

// Conversion result codes.
enum : int {
  SWIG_OK = 0,
  SWIG_ERROR = -1,
  SWIG_IOError = -2,
  SWIG_RuntimeError = -3,
  SWIG_IndexError = -4,
  SWIG_TypeError = -5,
  SWIG_DivisionByZero = -6,
  SWIG_OverflowError = -7,
  SWIG_SyntaxError = -8,
  SWIG_ValueError = -9,
  SWIG_SystemError = -10,
  SWIG_AttributeError = -11,
  SWIG_MemoryError = -12,
  SWIG_NullReferenceError = -13,
  SWIG_ERROR_RELEASE_NOT_OWNED = -200,
};

inline bool SWIG_IsOK(int r) { return r >= 0; }
inline bool SWIG_IsNewObj(int r) { return SWIG_IsOK(r) && (r & SWIG_NEWOBJMASK); }
// The argument-error rule: a generic failure is reported as a type error.
inline int SWIG_ArgError(int r) { return r != SWIG_ERROR ? r : SWIG_TypeError; }

namespace swigrt {

// --- start-up -------------------------------------------------------------
namespace detail {
extern PyObject *this_string;        // what ThisString() made, or null
extern PyTypeObject *wrapper_type;   // what SwigPyObject_type() made, or null
}
PyObject *ThisString();                 // interned "this", made once (borrowed)
// The same, read without a call where the module has started.
inline PyObject *ThisStringFast() {
  return detail::this_string ? detail::this_string : ThisString();
}
PyObject *TypeCache();                  // the type_cache dictionary, made once (borrowed)
PyTypeObject *SwigPyObject_type();      // null if readying failed
inline PyTypeObject *SwigPyObjectTypeFast() {
  return detail::wrapper_type ? detail::wrapper_type : SwigPyObject_type();
}
PyTypeObject *SwigPyPacked_type();
void FixMethods(PyMethodDef *methods, const swig_const_info *const_table,
                swig_type_info **types, swig_type_info **types_initial);
void InitializeModule(swig_module_info *module);
void InstallConstants(PyObject *dict, const swig_const_info *constants);
// Stores a fresh value under `name` and drops the local reference.
void SetConstant(PyObject *dict, const char *name, PyObject *value);

// The two module-level functions at the head of every method table;
// `proxydoc_methods` is the table searched by name.
void SetProxyDocMethods(PyMethodDef *proxydoc_methods);
PyObject *PyInstanceMethod_New(PyObject *self, PyObject *func);
PyObject *PyStaticMethod_New(PyObject *self, PyObject *func);

// --- wrapped pointer objects ------------------------------------------------
PyObject *SwigPyObject_New(void *ptr, swig_type_info *ty, int own);
bool SwigPyObject_Check(PyObject *op);
// The wrapper behind `obj`, borrowed; never raises. A "this" that the lookup
// itself made (a property returning a fresh wrapper) is kept alive until the
// outermost CallScope ends, so the pointer read from it stays valid for the
// call. A chain of "this" longer than kMaxThisDepth (a loop) finds nothing.
SwigPyObject *GetSwigThis(PyObject *obj);
constexpr int kMaxThisDepth = 64;
int SetSwigThis(PyObject *inst, PyObject *swig_this);
// Makes every wrapper in the chain of `obj` that points at `ptr` point at
// nothing and own nothing: the object is gone.
void ForgetPointer(PyObject *obj, void *ptr);

// Takes over a reference that must live until the outermost CallScope ends.
void KeepForCall(PyObject *obj);

namespace detail {
extern int call_depth;
extern bool have_kept;
void ReleaseKept();
}  // namespace detail

// Brackets every call into the module (entry points, forwarded calls): the
// values GetSwigThis had to keep are released when the outermost one ends.
// Everything runs under the interpreter lock, so plain counters do.
class CallScope {
 public:
  CallScope() { ++detail::call_depth; }
  ~CallScope() {
    if (--detail::call_depth == 0 && detail::have_kept) detail::ReleaseKept();
  }
  CallScope(const CallScope &) = delete;
  CallScope &operator=(const CallScope &) = delete;
};
PyObject *SwigPyPacked_New(void *ptr, size_t size, swig_type_info *ty);
bool SwigPyPacked_Check(PyObject *op);

// --- descriptors and conversion ----------------------------------------------
const char *PrettyName(const swig_type_info *ty);  // null for a null descriptor
swig_cast_info *TypeCheck(const char *source_name, swig_type_info *target);
swig_type_info *TypeQuery(const char *type_string);
int ConvertPtr(PyObject *obj, void **out, swig_type_info *ty, int flags, int *own = nullptr);
PyObject *NewPointerObj(PyObject *self, void *ptr, swig_type_info *ty, int flags);
// A pointer or reference that a member returns is lent by the object the
// member was called on (`self`): it may lead into it (a reference to one of
// its members). The new wrapper does not own `ptr` and keeps `self` alive,
// so that `owner().part()` on a temporary owner stays valid.
PyObject *LentPointerObj(PyObject *self, void *ptr, swig_type_info *ty);
// As LentPointerObj, for a result of the member's own class: when it is the
// object itself (`return *this`, whose pointer is `self_ptr`), the call gives
// back `self` (so `a.add(1).add(2)` chains on a temporary).
inline PyObject *SelfOrLentPointerObj(PyObject *self, void *self_ptr, void *ptr,
                                      swig_type_info *ty) {
  if (ptr && ptr == self_ptr) return Py_NewRef(self);
  return LentPointerObj(self, ptr, ty);
}
int ConvertFunctionPtr(PyObject *obj, void **out, swig_type_info *ty);
int AcquireOwnership(PyObject *obj, int own);  // ownership take-over

// The shared bodies of <Class>_swigregister and <Class>_swiginit.
PyObject *RegisterClass(PyObject *args, swig_type_info *ty);
PyObject *ShadowInit(PyObject *self, PyObject *args);

// --- global-variable link -------------------------------------------------------
typedef PyObject *(*GlobalGetter)();
typedef int (*GlobalSetter)(PyObject *value);
PyObject *Globals();  // the link object, made on first use (borrowed); null on failure
void AddVariable(PyObject *link, const char *name, GlobalGetter get, GlobalSetter set);

}  // namespace swigrt
