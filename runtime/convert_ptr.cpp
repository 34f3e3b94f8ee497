// Pointer conversion in both directions, ownership hand-over, and the class
// records that <Class>_swigregister attaches to descriptors.
//
// Conversion never raises: it answers with a status code and leaves the
// message to the entry point, which knows the method and argument. The one
// place that runs Python code (implicit conversion through a class's
// constructor) swallows what that code raises.

#include <cstdlib>
#include <cstring>

#include "errors.h"
#include "internal.h"
#include "swigrt.h"

namespace swigrt {
namespace {

SwigPyObject *AsWrapper(PyObject *op) { return reinterpret_cast<SwigPyObject *>(op); }

SwigPyClientData *ClientDataOf(const swig_type_info *ty) {
  return ty ? static_cast<SwigPyClientData *>(ty->clientdata) : nullptr;
}

// Builds a temporary of the target class from `obj` and converts that. The
// guard on the class record stops a constructor that itself converts its
// argument implicitly from recursing forever.
int ImplicitConvert(PyObject *obj, void **out, swig_type_info *ty) {
  int status = SWIG_ERROR;
  SwigPyClientData *data = ClientDataOf(ty);
  if (data && !data->implicitconv && data->klass) {
    PyObject *type, *value, *traceback;
    PyErr_Fetch(&type, &value, &traceback);
    data->implicitconv = 1;
    PyObject *made = PyObject_CallOneArg(data->klass, obj);
    data->implicitconv = 0;
    if (!made) PyErr_Clear();
    PyErr_Restore(type, value, traceback);
    if (made) {
      if (SwigPyObject *made_this = GetSwigThis(made)) {
        void *ptr = nullptr;
        status = ConvertPtr(reinterpret_cast<PyObject *>(made_this), &ptr, ty, 0);
        // The caller receives the temporary's C++ object and must delete it;
        // the Python temporary gives it up so that both do not. A check-only
        // conversion leaves it with the temporary, which deletes it below.
        if (SWIG_IsOK(status) && out) {
          *out = ptr;
          made_this->own = 0;
          status |= SWIG_NEWOBJMASK;
        }
      }
      Py_DECREF(made);
    }
  }
  if (!SWIG_IsOK(status) && obj == Py_None) {
    if (out) *out = nullptr;
    status = SWIG_OK;
  }
  return status;
}

// A proxy instance made without running its __init__: the C++ object
// already exists and arrives as `wrapper`.
PyObject *NewProxyInstance(SwigPyClientData *data, PyObject *wrapper) {
  PyObject *inst = nullptr;
  if (data->newraw) {
    inst = PyObject_Call(data->newraw, data->newargs, nullptr);
  } else if (PyType_Check(data->klass) && reinterpret_cast<PyTypeObject *>(data->klass)->tp_new) {
    auto *klass = reinterpret_cast<PyTypeObject *>(data->klass);
    PyObject *args = PyTuple_New(0);
    PyObject *kwargs = args ? PyDict_New() : nullptr;
    if (kwargs) inst = klass->tp_new(klass, args, kwargs);
    Py_XDECREF(args);
    Py_XDECREF(kwargs);
  } else {
    // A class that offers no way to make an instance gets the bare wrapper.
    Py_INCREF(wrapper);
    return wrapper;
  }
  // "this" lives in the instance's own dictionary, so the class's attribute
  // cache stays valid and is deliberately left alone: invalidating it on
  // every wrap would cost every later attribute lookup on the class.
  if (inst && SetSwigThis(inst, wrapper) != 0) Py_CLEAR(inst);
  return inst;
}

int HexValue(char c) {
  if (c >= '0' && c <= '9') return c - '0';
  if (c >= 'a' && c <= 'f') return c - 'a' + 10;
  return -1;
}

// Reads "_<hex bytes><type name>" or "NULL"; returns the type name to look
// up (`own_name` for "NULL"), or null when the text is malformed.
const char *UnpackPointerText(const char *text, void **ptr, const char *own_name) {
  if (*text != '_') {
    if (std::strcmp(text, "NULL") != 0) return nullptr;
    *ptr = nullptr;
    return own_name;
  }
  ++text;
  unsigned char bytes[sizeof(void *)];
  for (unsigned char &byte : bytes) {
    int high = HexValue(text[0]);
    int low = high < 0 ? -1 : HexValue(text[1]);
    if (low < 0) return nullptr;
    byte = static_cast<unsigned char>(high << 4 | low);
    text += 2;
  }
  std::memcpy(ptr, bytes, sizeof bytes);
  return text;
}

void AttachClientData(swig_type_info *ty, SwigPyClientData *data) {
  ty->clientdata = data;
  if (!data) return;
  // Descriptors that reach this one without a converter are the same C++
  // type under another record; they get the class too unless they have one.
  for (swig_cast_info *cast = ty->cast; cast; cast = cast->next) {
    swig_type_info *source = cast->type;
    if (!cast->converter && source && source != ty && !source->clientdata)
      AttachClientData(source, data);
  }
}

}  // namespace

int ConvertPtr(PyObject *obj, void **out, swig_type_info *ty, int flags, int *own) {
  if (!obj) return SWIG_ERROR;
  if (obj == Py_None && !(flags & SWIG_POINTER_IMPLICIT_CONV)) {
    if (out) *out = nullptr;
    return (flags & SWIG_POINTER_NO_NULL) ? SWIG_NullReferenceError : SWIG_OK;
  }

  SwigPyObject *sobj = GetSwigThis(obj);
  if (own) *own = 0;
  // Walk the "this" chain for the first wrapper whose type is the target or
  // converts to it.
  for (; sobj; sobj = sobj->next ? AsWrapper(sobj->next) : nullptr) {
    if (!ty || sobj->ty == ty) {
      if (out) *out = sobj->ptr;
      break;
    }
    swig_cast_info *cast = sobj->ty ? TypeCheck(sobj->ty->name, ty) : nullptr;
    if (!cast) continue;
    if (out) {
      int new_memory = 0;
      *out = cast->converter ? cast->converter(sobj->ptr, &new_memory) : sobj->ptr;
      if (new_memory == SWIG_CAST_NEW_MEMORY && own) *own |= SWIG_CAST_NEW_MEMORY;
    }
    break;
  }

  if (sobj) {
    // Releasing means taking over the object; only an owner can give it.
    if ((flags & SWIG_POINTER_RELEASE) == SWIG_POINTER_RELEASE && !sobj->own)
      return SWIG_ERROR_RELEASE_NOT_OWNED;
    if (own) *own |= sobj->own;
    if (flags & SWIG_POINTER_DISOWN) sobj->own = 0;
    if (flags & (SWIG_POINTER_CLEAR | SWIG_POINTER_FORGET)) sobj->ptr = nullptr;
    return SWIG_OK;
  }
  if (!(flags & SWIG_POINTER_IMPLICIT_CONV)) return SWIG_ERROR;
  return ImplicitConvert(obj, out, ty);
}

PyObject *NewPointerObj(PyObject *, void *ptr, swig_type_info *ty, int flags) {
  if (!ptr) Py_RETURN_NONE;
  int own = (flags & SWIG_POINTER_OWN) ? SWIG_POINTER_OWN : 0;
  PyObject *wrapper = SwigPyObject_New(ptr, ty, own);
  SwigPyClientData *data = ClientDataOf(ty);
  if (!wrapper || !data || (flags & SWIG_POINTER_NOSHADOW)) return wrapper;
  PyObject *inst = NewProxyInstance(data, wrapper);
  Py_DECREF(wrapper);
  return inst;
}

PyObject *LentPointerObj(PyObject *self, void *ptr, swig_type_info *ty) {
  PyObject *result = NewPointerObj(nullptr, ptr, ty, 0);
  // A proxy instance made here and nowhere else keeps its lender in its own
  // dictionary; a bare wrapper has no room for it and stays as it is.
  if (result && result != Py_None && !SwigPyObject_Check(result) && Py_REFCNT(result) == 1) {
    static PyObject *lender = PyUnicode_InternFromString("_lender");
    if (!lender || PyObject_GenericSetAttr(result, lender, self) < 0) Py_CLEAR(result);
  }
  return result;
}

int ConvertFunctionPtr(PyObject *obj, void **out, swig_type_info *ty) {
  if (!PyCFunction_Check(obj)) return ConvertPtr(obj, out, ty, 0);
  // A built-in function stands for a C function pointer only through the
  // packed pointer that start-up wrote into its documentation.
  const char *doc = reinterpret_cast<PyCFunctionObject *>(obj)->m_ml->ml_doc;
  static const char kMarker[] = "swig_ptr: ";
  const char *marker = doc ? std::strstr(doc, kMarker) : nullptr;
  if (!marker || !ty) return SWIG_ERROR;
  void *ptr = nullptr;
  const char *name = UnpackPointerText(marker + sizeof kMarker - 1, &ptr, ty->name);
  if (!name) return SWIG_ERROR;
  swig_cast_info *cast = TypeCheck(name, ty);
  if (!cast) return SWIG_ERROR;
  int new_memory = 0;
  void *converted = cast->converter ? cast->converter(ptr, &new_memory) : ptr;
  if (out) *out = converted;
  return SWIG_OK;
}

int AcquireOwnership(PyObject *obj, int own) {
  if (own != SWIG_POINTER_OWN) return 0;
  SwigPyObject *sobj = GetSwigThis(obj);
  if (!sobj) return 0;
  int previous = sobj->own;
  sobj->own = SWIG_POINTER_OWN;
  detail::HoldTable(sobj);
  return previous;
}

PyObject *RegisterClass(PyObject *args, swig_type_info *ty) {
  PyObject *klass = nullptr;
  if (!UnpackTuple(args, "swigregister", 1, 1, &klass)) return nullptr;
  AttachClientData(ty, detail::NewClientData(klass));
  ty->owndata = 1;
  Py_RETURN_NONE;
}

PyObject *ShadowInit(PyObject *, PyObject *args) {
  PyObject *objs[2] = {nullptr, nullptr};
  if (!UnpackTuple(args, "swiginit", 2, 2, objs)) return nullptr;
  // A type's attributes are its class's: a "this" stored there would be
  // found by every instance, the type object itself included.
  if (PyType_Check(objs[0])) {
    PyErr_SetString(PyExc_TypeError, "Attempt to set 'this' on a type object");
    return nullptr;
  }
  if (SwigPyObject *sthis = GetSwigThis(objs[0])) {
    // A second constructor wrapper for the same instance extends the chain.
    PyObject *result = detail::AppendThis(reinterpret_cast<PyObject *>(sthis), objs[1]);
    if (!result) return nullptr;
    Py_DECREF(result);
  } else if (SetSwigThis(objs[0], objs[1]) != 0) {
    return nullptr;
  }
  Py_RETURN_NONE;
}

namespace detail {

SwigPyClientData *NewClientData(PyObject *klass) {
  auto *data = static_cast<SwigPyClientData *>(std::calloc(1, sizeof(SwigPyClientData)));
  if (!data) return nullptr;
  if (!PyType_Check(klass)) {
    // An object that is not a type is instantiated through its __new__
    // with itself as the one argument.
    data->newargs = PyTuple_Pack(1, klass);
    if (!data->newargs) {
      PyErr_Clear();
      std::free(data);
      return nullptr;
    }
    data->newraw = PyObject_GetAttrString(klass, "__new__");
    if (!data->newraw) PyErr_Clear();
  } else {
    Py_INCREF(klass);
    data->newargs = klass;
  }
  Py_INCREF(klass);
  data->klass = klass;
  data->destroy = PyObject_GetAttrString(klass, "__swig_destroy__");
  if (!data->destroy) PyErr_Clear();
  // A one-object built-in (delete_<Class>) is called with the dying wrapper
  // itself; anything else gets a fresh wrapper as its argument.
  bool one_object_builtin = data->destroy && PyCFunction_Check(data->destroy) &&
                            (PyCFunction_GET_FLAGS(data->destroy) & METH_O);
  data->delargs = one_object_builtin ? 0 : 1;
  data->implicitconv = 0;
  data->pytype = nullptr;
  return data;
}

void DeleteClientData(SwigPyClientData *data) {
  Py_XDECREF(data->klass);
  Py_XDECREF(data->newraw);
  Py_XDECREF(data->newargs);
  Py_XDECREF(data->destroy);
  std::free(data);
}

}  // namespace detail
}  // namespace swigrt
