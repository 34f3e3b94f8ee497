// swigvarlink: the `cvar` object through which C++ static variables are read
// and written by name.
//
// Each variable is a getter/setter pair made for it alone. Variables are
// added at the head of a singly linked list, so the newest comes first in
// lookups and in the printed list.

#include <cstdlib>
#include <cstring>

#include "internal.h"
#include "swigrt.h"

namespace swigrt {
namespace {

struct GlobalVar {
  char *name;
  GlobalGetter get_attr;
  GlobalSetter set_attr;
  GlobalVar *next;
};

struct VarLink {
  PyObject_HEAD
  GlobalVar *vars;
};

VarLink *AsLink(PyObject *op) { return reinterpret_cast<VarLink *>(op); }

// The runtime's own reference; the module dictionary holds another as `cvar`.
PyObject *link_object = nullptr;

GlobalVar *Find(PyObject *self, const char *name) {
  for (GlobalVar *var = AsLink(self)->vars; var; var = var->next)
    if (var->name && std::strcmp(var->name, name) == 0) return var;
  return nullptr;
}

void UnknownVariable(const char *name) {
  PyErr_Format(PyExc_AttributeError, "Unknown C global variable '%s'", name);
}

PyObject *GetAttr(PyObject *self, char *name) {
  PyObject *result = nullptr;
  if (GlobalVar *var = Find(self, name)) result = var->get_attr();
  if (!result && !PyErr_Occurred()) UnknownVariable(name);
  return result;
}

int SetAttr(PyObject *self, char *name, PyObject *value) {
  // Setters answer 0 or 1; the interpreter expects 0 or -1. A deletion
  // reaches the setter with a null value, which its conversion refuses.
  int result = 1;
  if (GlobalVar *var = Find(self, name)) result = var->set_attr(value);
  if (result == 0) return 0;
  if (!PyErr_Occurred()) UnknownVariable(name);
  return -1;
}

PyObject *Repr(PyObject *) { return PyUnicode_InternFromString("<Swig global variables>"); }

PyObject *Str(PyObject *self) {
  PyObject *names = PyList_New(0);
  if (!names) return nullptr;
  for (GlobalVar *var = AsLink(self)->vars; var; var = var->next) {
    PyObject *name = PyUnicode_FromString(var->name ? var->name : "");
    if (!name || PyList_Append(names, name) < 0) {
      Py_XDECREF(name);
      Py_DECREF(names);
      return nullptr;
    }
    Py_DECREF(name);
  }
  PyObject *separator = PyUnicode_FromString(", ");
  PyObject *joined = separator ? PyUnicode_Join(separator, names) : nullptr;
  Py_XDECREF(separator);
  Py_DECREF(names);
  if (!joined) return nullptr;
  PyObject *text = PyUnicode_FromFormat("(%U)", joined);
  Py_DECREF(joined);
  return text;
}

void Dealloc(PyObject *self) {
  GlobalVar *var = AsLink(self)->vars;
  while (var) {
    GlobalVar *next = var->next;
    std::free(var->name);
    std::free(var);
    var = next;
  }
  PyObject_Free(self);
}

PyTypeObject *BuildLinkType() {
  static PyTypeObject type;  // zero-initialised: unnamed slots stay empty
  Py_SET_REFCNT(reinterpret_cast<PyObject *>(&type), 1);
  type.tp_name = "swigvarlink";
  type.tp_basicsize = sizeof(VarLink);
  type.tp_dealloc = Dealloc;
  // The by-name slots: variables are not attributes in any dictionary.
  type.tp_getattr = GetAttr;
  type.tp_setattr = SetAttr;
  type.tp_repr = Repr;
  type.tp_str = Str;
  type.tp_flags = Py_TPFLAGS_DEFAULT;
  type.tp_doc = "Swig var link object";
  if (PyType_Ready(&type) < 0) return nullptr;
  return &type;
}

PyTypeObject *LinkType() {
  static PyTypeObject *const type = BuildLinkType();
  return type;
}

}  // namespace

PyObject *Globals() {
  if (!link_object) {
    PyTypeObject *type = LinkType();
    if (!type) return nullptr;
    VarLink *link = PyObject_New(VarLink, type);
    if (!link) return nullptr;
    link->vars = nullptr;
    link_object = reinterpret_cast<PyObject *>(link);
  }
  return link_object;
}

void AddVariable(PyObject *link, const char *name, GlobalGetter get, GlobalSetter set) {
  if (!link || Py_TYPE(link) != LinkType()) return;
  // Out of memory leaves the list in a reduced but walkable state: a
  // record whose name could not be copied is linked alone (nameless, no
  // successor), and a record that could not be made empties the list.
  auto *var = static_cast<GlobalVar *>(std::calloc(1, sizeof(GlobalVar)));
  if (var) {
    size_t size = std::strlen(name) + 1;
    var->name = static_cast<char *>(std::malloc(size));
    if (var->name) {
      std::memcpy(var->name, name, size);
      var->get_attr = get;
      var->set_attr = set;
      var->next = AsLink(link)->vars;
    }
  }
  AsLink(link)->vars = var;
}

namespace detail {
void ReleaseGlobals() { Py_CLEAR(link_object); }
}  // namespace detail

}  // namespace swigrt
