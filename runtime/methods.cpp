// openvorla._methods: the method type of the proxy classes.
//
// A proxy class binds each member to the module's built-in function for it.
// Made an instance method the ordinary way, every call through an instance
// would first make a bound method; `method` is a method descriptor with a
// vectorcall instead, so `node.compute(plug, data)` calls the built-in with
// the instance in place, as `VPxNode.compute(node, plug, data)` does. The
// built-in sees exactly the arguments it would have seen through a bound
// method (its upcall test included), and whatever is not its fast path, with
// every error message, is the built-in's own call.
#define PY_SSIZE_T_CLEAN
#include <Python.h>
#include <structmember.h>

#include <cstddef>

namespace {

struct Method {
  PyObject_HEAD
  PyObject *function;  // the built-in
  PyCFunction cfunc;
  PyObject *cself;
  int flags;
  vectorcallfunc vectorcall;
  PyObject *doc;       // None, or the text the proxy module gives it
  PyObject *signature; // __text_signature__, or None
};

PyObject *Call(PyObject *self, PyObject *const *args, size_t nargsf, PyObject *kwnames) {
  auto *m = reinterpret_cast<Method *>(self);
  Py_ssize_t nargs = PyVectorcall_NARGS(nargsf);
  if (!kwnames) {
    if (m->flags == METH_O && nargs == 1) return m->cfunc(m->cself, args[0]);
    if (m->flags == METH_FASTCALL)
      return reinterpret_cast<_PyCFunctionFast>(reinterpret_cast<void (*)()>(m->cfunc))(
          m->cself, args, nargs);
    if (m->flags == METH_VARARGS) {
      PyObject *tuple = PyTuple_New(nargs);
      if (!tuple) return nullptr;
      for (Py_ssize_t i = 0; i < nargs; ++i) PyTuple_SET_ITEM(tuple, i, Py_NewRef(args[i]));
      PyObject *result = m->cfunc(m->cself, tuple);
      Py_DECREF(tuple);
      return result;
    }
  }
  return PyObject_Vectorcall(m->function, args, nargsf, kwnames);
}

// method(builtin, doc=None, signature=None): the documentation lives in the
// proxy module, since the method table's entries carry none.
PyObject *New(PyTypeObject *type, PyObject *args, PyObject *kwargs) {
  PyObject *function;
  PyObject *doc = Py_None;
  PyObject *signature = Py_None;
  if (kwargs && PyDict_GET_SIZE(kwargs)) {
    PyErr_SetString(PyExc_TypeError, "method() takes no keyword arguments");
    return nullptr;
  }
  if (!PyArg_ParseTuple(args, "O!|OO:method", &PyCFunction_Type, &function, &doc, &signature))
    return nullptr;
  if (signature != Py_None && !PyUnicode_Check(signature)) {
    PyErr_SetString(PyExc_TypeError, "method() signature must be a str or None");
    return nullptr;
  }
  auto *m = reinterpret_cast<Method *>(type->tp_alloc(type, 0));
  if (!m) return nullptr;
  m->function = Py_NewRef(function);
  m->cfunc = PyCFunction_GET_FUNCTION(function);
  m->cself = PyCFunction_GET_SELF(function);
  m->flags = PyCFunction_GET_FLAGS(function) & (METH_VARARGS | METH_O | METH_NOARGS | METH_KEYWORDS |
                                                METH_FASTCALL);
  m->vectorcall = Call;
  m->doc = Py_NewRef(doc);
  m->signature = Py_NewRef(signature);
  return reinterpret_cast<PyObject *>(m);
}

void Dealloc(PyObject *self) {
  auto *m = reinterpret_cast<Method *>(self);
  Py_XDECREF(m->function);
  Py_XDECREF(m->doc);
  Py_XDECREF(m->signature);
  Py_TYPE(self)->tp_free(self);
}

// Through an instance, a bound method (for `f = node.compute`); through the
// class, the descriptor itself, called with the instance first.
PyObject *Get(PyObject *self, PyObject *obj, PyObject *) {
  if (!obj || obj == Py_None) return Py_NewRef(self);
  return PyMethod_New(self, obj);
}

PyObject *Name(PyObject *self, void *) {
  return PyObject_GetAttrString(reinterpret_cast<Method *>(self)->function, "__name__");
}

// None: inspect.signature stops unwrapping here and reads __text_signature__
// instead of going on to the built-in, which has none.
PyObject *Signature(PyObject *, void *) { Py_RETURN_NONE; }

PyObject *Repr(PyObject *self) {
  PyObject *name = Name(self, nullptr);
  if (!name) return nullptr;
  PyObject *text = PyUnicode_FromFormat("<proxy method %U>", name);
  Py_DECREF(name);
  return text;
}

PyMemberDef members[] = {
    {"__wrapped__", T_OBJECT, offsetof(Method, function), READONLY, "the built-in function"},
    {"__doc__", T_OBJECT, offsetof(Method, doc), 0, nullptr},
    {"__text_signature__", T_OBJECT, offsetof(Method, signature), 0, nullptr},
    {nullptr, 0, 0, 0, nullptr},
};

PyGetSetDef getset[] = {
    {"__name__", Name, nullptr, "the name of the built-in function", nullptr},
    {"__signature__", Signature, nullptr, nullptr, nullptr},
    {nullptr, nullptr, nullptr, nullptr, nullptr},
};

PyTypeObject MethodType;  // filled in at import, as the other static types are

PyModuleDef module_def = {PyModuleDef_HEAD_INIT, "_methods",
                          "The method type of the proxy classes.", -1, nullptr, nullptr,
                          nullptr, nullptr, nullptr};

}  // namespace

extern "C" __attribute__((visibility("default"))) PyObject *PyInit__methods() {
  Py_SET_REFCNT(reinterpret_cast<PyObject *>(&MethodType), 1);
  MethodType.tp_name = "openvorla._methods.method";
  MethodType.tp_basicsize = sizeof(Method);
  MethodType.tp_dealloc = Dealloc;
  MethodType.tp_repr = Repr;
  MethodType.tp_call = PyVectorcall_Call;
  MethodType.tp_flags =
      Py_TPFLAGS_DEFAULT | Py_TPFLAGS_METHOD_DESCRIPTOR | Py_TPFLAGS_HAVE_VECTORCALL;
  MethodType.tp_vectorcall_offset = offsetof(Method, vectorcall);
  MethodType.tp_doc =
      "method(builtin, doc=None, signature=None): the built-in as a method of a proxy class";
  MethodType.tp_members = members;
  MethodType.tp_getset = getset;
  MethodType.tp_descr_get = Get;
  MethodType.tp_new = New;
  if (PyType_Ready(&MethodType) < 0) return nullptr;
  PyObject *m = PyModule_Create(&module_def);
  if (!m) return nullptr;
  if (PyModule_AddObjectRef(m, "method", reinterpret_cast<PyObject *>(&MethodType)) < 0) {
    Py_DECREF(m);
    return nullptr;
  }
  return m;
}
