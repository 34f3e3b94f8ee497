// SwigPyObject: the Python object that carries a C++ pointer, and the "this" chain.
//
// A wrapper owns its C++ object only while `own` is 1; when an owning
// wrapper dies it calls the class's destructor (the `__swig_destroy__` of
// the class registered for its descriptor). Proxy instances keep their
// wrapper under the attribute "this"; several wrappers may be chained through
// `next`, newest-appended directly behind the head.
//
// Wrappers made by a sibling module have that module's SwigPyObject type.
// They share our layout up to `next`, so every check that asks "is this a
// wrapper" also accepts a type that is merely named "SwigPyObject", and only
// objects of our own type are ever touched beyond `next`.

#include <cstdint>
#include <cstdio>
#include <cstring>
#include <vector>

#include "internal.h"
#include "swigrt.h"

namespace swigrt {
namespace {

SwigPyObject *AsWrapper(PyObject *op) { return reinterpret_cast<SwigPyObject *>(op); }

void SetOwn(SwigPyObject *sobj, bool own) {
  if (own) {
    sobj->own = SWIG_POINTER_OWN;
    detail::HoldTable(sobj);
  } else {
    sobj->own = 0;
  }
}

PyObject *Disown(PyObject *self, PyObject *) {
  SetOwn(AsWrapper(self), false);
  Py_RETURN_NONE;
}

PyObject *Acquire(PyObject *self, PyObject *) {
  SetOwn(AsWrapper(self), true);
  Py_RETURN_NONE;
}

PyObject *Own(PyObject *self, PyObject *args) {
  PyObject *value = nullptr;
  if (!PyArg_UnpackTuple(args, "own", 0, 1, &value)) return nullptr;
  SwigPyObject *sobj = AsWrapper(self);
  PyObject *previous = PyBool_FromLong(sobj->own);
  if (value) {
    int truth = PyObject_IsTrue(value);
    if (truth < 0) {
      // A value whose truth cannot be decided asks for ownership; the call
      // itself still succeeds, so its error must not stay pending.
      PyErr_Clear();
      truth = 1;
    }
    SetOwn(sobj, truth != 0);
  }
  return previous;
}

PyObject *Append(PyObject *self, PyObject *obj) { return detail::AppendThis(self, obj); }

PyObject *Next(PyObject *self, PyObject *) {
  PyObject *next = AsWrapper(self)->next;
  if (!next) Py_RETURN_NONE;
  Py_INCREF(next);
  return next;
}

// One text per wrapper of the chain, back to back; built in a loop, since a
// chain can be far longer than the C stack is deep.
PyObject *Repr(PyObject *self) {
  _PyUnicodeWriter writer;
  _PyUnicodeWriter_Init(&writer);
  writer.overallocate = 1;  // amortised growth: a chain can be long
  for (PyObject *link = self; link; link = AsWrapper(link)->next) {
    const char *name = PrettyName(AsWrapper(link)->ty);
    PyObject *text = PyUnicode_FromFormat("<Swig Object of type '%s' at %p>",
                                          name ? name : "unknown", static_cast<void *>(link));
    int failed = !text || _PyUnicodeWriter_WriteStr(&writer, text) < 0;
    Py_XDECREF(text);
    if (failed) {
      _PyUnicodeWriter_Dealloc(&writer);
      return nullptr;
    }
  }
  return _PyUnicodeWriter_Finish(&writer);
}

PyObject *ReprMethod(PyObject *self, PyObject *) { return Repr(self); }

PyObject *AsInt(PyObject *self) {
  return PyLong_FromUnsignedLongLong(reinterpret_cast<uintptr_t>(AsWrapper(self)->ptr));
}

PyObject *RichCompare(PyObject *v, PyObject *w, int op) {
  // Only identity of the C++ object is meaningful; ordering of addresses is
  // not offered. A right operand that is no wrapper has no pointer to compare.
  if ((op != Py_EQ && op != Py_NE) || !SwigPyObject_Check(w)) Py_RETURN_NOTIMPLEMENTED;
  bool equal = reinterpret_cast<uintptr_t>(AsWrapper(v)->ptr) ==
               reinterpret_cast<uintptr_t>(AsWrapper(w)->ptr);
  return PyBool_FromLong(equal == (op == Py_EQ));
}

void RunDestructor(SwigPyObject *sobj, SwigPyClientData *data) {
  // The destructor is ordinary Python-callable code: it must not see an error
  // that was pending when the wrapper died, and whatever it raises must not
  // replace that error.
  PyObject *type, *value, *traceback;
  PyErr_Fetch(&type, &value, &traceback);
  PyObject *destroy = data->destroy;
  PyObject *result = nullptr;
  if (data->delargs) {
    // A destructor that is not a one-object built-in gets its own
    // non-owning wrapper, so that the dying one is never handed out.
    PyObject *tmp = SwigPyObject_New(sobj->ptr, sobj->ty, 0);
    if (tmp) {
      result = PyObject_CallOneArg(destroy, tmp);
      Py_DECREF(tmp);
    }
  } else {
    // The one-object built-in (delete_<Class>) takes the dying wrapper
    // itself; calling its C function directly avoids any new reference to it.
    PyCFunction meth = PyCFunction_GET_FUNCTION(destroy);
    PyObject *mself = (PyCFunction_GET_FLAGS(destroy) & METH_STATIC) ? nullptr
                                                                      : PyCFunction_GET_SELF(destroy);
    result = meth(mself, reinterpret_cast<PyObject *>(sobj));
  }
  if (!result) PyErr_WriteUnraisable(destroy);
  PyErr_Restore(type, value, traceback);
  Py_XDECREF(result);
}

void Dealloc(PyObject *self) {
  SwigPyObject *sobj = AsWrapper(self);
  PyObject *next = sobj->next;
  if (sobj->own == SWIG_POINTER_OWN) {
    swig_type_info *ty = sobj->ty;
    auto *data = ty ? static_cast<SwigPyClientData *>(ty->clientdata) : nullptr;
    if (data && data->destroy) {
      RunDestructor(sobj, data);
    } else {
      const char *name = PrettyName(ty);
      std::printf("swig/python detected a memory leak of type '%s', no destructor found.\n",
                  name ? name : "unknown");
      std::fflush(stdout);
    }
  }
  if (sobj->table) {
    detail::NoteCapsuleReleased();
    Py_DECREF(sobj->table);
  }
  PyObject_Free(self);
  // The rest of the chain, one wrapper at a time: releasing `next` from its
  // own deallocation would recurse once per link.
  while (next && Py_TYPE(next) == SwigPyObject_type()) {
    --AsWrapper(next)->links;
    if (Py_REFCNT(next) != 1) break;
    PyObject *after = AsWrapper(next)->next;
    AsWrapper(next)->next = nullptr;
    Py_DECREF(next);
    next = after;
  }
  Py_XDECREF(next);
}

PyMethodDef wrapper_methods[] = {
    {"disown", Disown, METH_NOARGS, "releases ownership of the pointer"},
    {"acquire", Acquire, METH_NOARGS, "acquires ownership of the pointer"},
    {"own", Own, METH_VARARGS, "returns/sets ownership of the pointer"},
    {"append", Append, METH_O, "appends another 'this' object"},
    {"next", Next, METH_NOARGS, "returns the next 'this' object"},
    {"__repr__", ReprMethod, METH_NOARGS, "returns object representation"},
    {nullptr, nullptr, 0, nullptr},
};

PyTypeObject *BuildWrapperType() {
  // Zero-initialised statics: every slot not named here stays empty.
  static PyNumberMethods number;
  static PyTypeObject type;
  number.nb_int = AsInt;
  Py_SET_REFCNT(reinterpret_cast<PyObject *>(&type), 1);
  type.tp_name = "SwigPyObject";
  type.tp_basicsize = sizeof(SwigPyObject);
  type.tp_dealloc = Dealloc;
  type.tp_repr = Repr;
  type.tp_as_number = &number;
  type.tp_getattro = PyObject_GenericGetAttr;
  type.tp_flags = Py_TPFLAGS_DEFAULT;
  type.tp_doc = "Swig object carries a C/C++ instance pointer";
  // An equality slot without a hash slot makes instances unhashable.
  type.tp_richcompare = RichCompare;
  type.tp_methods = wrapper_methods;
  if (PyType_Ready(&type) < 0) return nullptr;
  return &type;
}

}  // namespace

PyTypeObject *SwigPyObject_type() {
  static PyTypeObject *const type = BuildWrapperType();
  detail::wrapper_type = type;
  return type;
}

bool SwigPyObject_Check(PyObject *op) {
  PyTypeObject *type = Py_TYPE(op);
  return type == SwigPyObject_type() || std::strcmp(type->tp_name, "SwigPyObject") == 0;
}

PyObject *SwigPyObject_New(void *ptr, swig_type_info *ty, int own) {
  PyTypeObject *type = SwigPyObject_type();
  if (!type) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_SystemError, "SwigPyObject type is not ready");
    return nullptr;
  }
  SwigPyObject *sobj = PyObject_New(SwigPyObject, type);
  if (!sobj) return nullptr;
  sobj->ptr = ptr;
  sobj->ty = ty;
  sobj->own = own;
  sobj->next = nullptr;
  sobj->table = nullptr;
  sobj->links = 0;
  if (own == SWIG_POINTER_OWN) detail::HoldTable(sobj);
  return reinterpret_cast<PyObject *>(sobj);
}

namespace detail {

PyTypeObject *wrapper_type = nullptr;
int call_depth = 0;
bool have_kept = false;
std::vector<PyObject *> kept;

void ReleaseKept() {
  // Releasing may run Python code that calls into the module again and
  // keeps more: take the list first.
  while (!kept.empty()) {
    std::vector<PyObject *> now;
    now.swap(kept);
    for (PyObject *obj : now) Py_DECREF(obj);
  }
  have_kept = false;
}

}  // namespace detail

void KeepForCall(PyObject *obj) {
  detail::kept.push_back(obj);
  detail::have_kept = true;
}

SwigPyObject *GetSwigThis(PyObject *obj) {
  // Callers may run with an error already pending (a string argument that
  // failed earlier in the same call); a failed lookup here must neither
  // raise nor swallow that error.
  for (int depth = 0; obj && !SwigPyObject_Check(obj); ++depth) {
    if (depth == kMaxThisDepth) return nullptr;
    PyObject *name = ThisString();
    if (!name) {
      PyErr_Clear();
      return nullptr;
    }
    PyObject *type, *value, *traceback;
    PyErr_Fetch(&type, &value, &traceback);
    PyObject *next = PyObject_GenericGetAttr(obj, name);
    if (!next) PyErr_Clear();
    PyErr_Restore(type, value, traceback);
    if (!next) return nullptr;
    // The instance keeps its "this" alive; a value that only the lookup
    // holds was made for it and must outlive the call. A "this" that is
    // itself a proxy instance is followed to its own "this".
    if (Py_REFCNT(next) == 1) {
      KeepForCall(next);
    } else {
      Py_DECREF(next);
    }
    obj = next;
  }
  return obj ? AsWrapper(obj) : nullptr;
}

void ForgetPointer(PyObject *obj, void *ptr) {
  if (!ptr) return;
  for (SwigPyObject *sobj = GetSwigThis(obj); sobj;
       sobj = sobj->next ? AsWrapper(sobj->next) : nullptr) {
    if (sobj->ptr == ptr) {
      sobj->ptr = nullptr;
      sobj->own = 0;
    }
  }
}

int SetSwigThis(PyObject *inst, PyObject *swig_this) {
  PyObject *name = ThisString();
  if (!name) return -1;
  return PyObject_GenericSetAttr(inst, name, swig_this);
}

namespace detail {

// Keeps `links` right when `next` of `from` gains or loses `to`; only links
// between wrappers of our own type are counted.
void CountLink(PyObject *from, PyObject *to, int delta) {
  PyTypeObject *own = SwigPyObject_type();
  if (to && Py_TYPE(from) == own && Py_TYPE(to) == own) AsWrapper(to)->links += delta;
}

void HoldTable(SwigPyObject *sobj) {
  if (sobj->table || Py_TYPE(sobj) != SwigPyObject_type()) return;
  PyObject *capsule = TableCapsule();
  if (!capsule) return;
  Py_INCREF(capsule);
  sobj->table = capsule;
  detail::NoteCapsuleHeld(capsule);
}

PyObject *AppendThis(PyObject *self, PyObject *obj) {
  if (!SwigPyObject_Check(obj)) {
    PyErr_SetString(PyExc_TypeError, "Attempt to append a non SwigPyObject");
    return nullptr;
  }
  SwigPyObject *receiver = AsWrapper(self);
  // A wrapper already in the chain would close it into a ring that
  // conversion and repr would walk forever. The head of a chain of our own
  // type is in no other chain, which spares the walk in the common case.
  bool head = Py_TYPE(obj) == SwigPyObject_type() && AsWrapper(obj)->links == 0;
  for (PyObject *link = self; link && (!head || link == self); link = AsWrapper(link)->next) {
    if (link == obj) {
      PyErr_SetString(PyExc_ValueError, "Attempt to append a SwigPyObject already in the chain");
      return nullptr;
    }
  }
  SwigPyObject *added = AsWrapper(obj);
  PyObject *dropped = added->next;
  PyObject *moved = receiver->next;
  Py_INCREF(obj);
  added->next = moved;  // the receiver's reference moves over
  receiver->next = obj;
  CountLink(self, moved, -1);
  CountLink(obj, moved, +1);
  CountLink(obj, dropped, -1);
  CountLink(self, obj, +1);
  Py_XDECREF(dropped);
  Py_RETURN_NONE;
}

}  // namespace detail
}  // namespace swigrt
