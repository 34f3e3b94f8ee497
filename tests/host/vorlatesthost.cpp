// Test-host module: what a test needs to look at the package as the host and
// the sibling modules see it.
#include <standin/Lifetime.h>
#include <standin/Plugins.h>

#include <cstdint>
#include <string>

#include "swigrt.h"
#include "text.h"

using OPENVORLA_NAMESPACE::VObject;
using OPENVORLA_NAMESPACE::VStringArray;

namespace {

swig_type_info *Descriptor(PyObject *name) {
  const char *text = PyUnicode_AsUTF8(name);
  if (!text) return nullptr;
  swig_type_info *ty = swigrt::TypeQuery(text);
  if (!ty) PyErr_Format(PyExc_LookupError, "no type descriptor for '%s'", text);
  return ty;
}

swig_module_info *SharedTable() {
  auto *table = static_cast<swig_module_info *>(
      PyCapsule_Import("swig_runtime_data4.type_pointer_capsule", 0));
  if (!table && !PyErr_Occurred()) PyErr_SetString(PyExc_LookupError, "no shared type table");
  return table;
}

PyObject *DescriptorTuple(const swig_type_info *ty) {
  return Py_BuildValue("(sz)", ty->name, ty->str);
}

PyObject *DescriptorRecord(swig_type_info *ty) {
  return Py_BuildValue("(szN)", ty->name, ty->str, PyLong_FromVoidPtr(ty));
}

// convert_ptr(obj, type_name, flags) -> (status, address, own)
PyObject *convert_ptr(PyObject *, PyObject *args) {
  PyObject *obj, *name;
  int flags;
  if (!PyArg_ParseTuple(args, "OUi", &obj, &name, &flags)) return nullptr;
  swig_type_info *ty = Descriptor(name);
  if (!ty) return nullptr;
  void *ptr = nullptr;
  int own = 0;
  int status = swigrt::ConvertPtr(obj, &ptr, ty, flags, &own);
  return Py_BuildValue("(iKi)", status, static_cast<unsigned long long>(reinterpret_cast<uintptr_t>(ptr)), own);
}

// check_ptr(obj, type_name, flags) -> status, converting without an output
PyObject *check_ptr(PyObject *, PyObject *args) {
  PyObject *obj, *name;
  int flags;
  if (!PyArg_ParseTuple(args, "OUi", &obj, &name, &flags)) return nullptr;
  swig_type_info *ty = Descriptor(name);
  if (!ty) return nullptr;
  return PyLong_FromLong(swigrt::ConvertPtr(obj, nullptr, ty, flags));
}

// new_pointer_obj(address, type_name, flags)
PyObject *new_pointer_obj(PyObject *, PyObject *args) {
  unsigned long long address;
  PyObject *name;
  int flags;
  if (!PyArg_ParseTuple(args, "KUi", &address, &name, &flags)) return nullptr;
  swig_type_info *ty = Descriptor(name);
  if (!ty) return nullptr;
  return swigrt::NewPointerObj(nullptr, reinterpret_cast<void *>(static_cast<uintptr_t>(address)), ty, flags);
}

// new_packed(data, type_name)
PyObject *new_packed(PyObject *, PyObject *args) {
  Py_buffer data;
  PyObject *name;
  if (!PyArg_ParseTuple(args, "y*U", &data, &name)) return nullptr;
  swig_type_info *ty = Descriptor(name);
  PyObject *result = ty ? swigrt::SwigPyPacked_New(data.buf, data.len, ty) : nullptr;
  PyBuffer_Release(&data);
  return result;
}

// type_query(text) -> (name, readable) or None
PyObject *type_query(PyObject *, PyObject *arg) {
  const char *text = PyUnicode_AsUTF8(arg);
  if (!text) return nullptr;
  swig_type_info *ty = swigrt::TypeQuery(text);
  if (!ty) Py_RETURN_NONE;
  return DescriptorTuple(ty);
}

// cast_list(type_name) -> source names in the list's current order
PyObject *cast_list(PyObject *, PyObject *arg) {
  swig_type_info *ty = Descriptor(arg);
  if (!ty) return nullptr;
  PyObject *out = PyList_New(0);
  for (swig_cast_info *c = ty->cast; out && c; c = c->next) {
    PyObject *s = PyUnicode_FromString(c->type->name);
    if (!s || PyList_Append(out, s) < 0) Py_CLEAR(out);
    Py_XDECREF(s);
  }
  return out;
}

// modules() -> per module sharing the table, its descriptors as (name, readable, address)
PyObject *modules(PyObject *, PyObject *) {
  swig_module_info *first = SharedTable();
  if (!first) return nullptr;
  PyObject *out = PyList_New(0);
  swig_module_info *m = first;
  do {
    PyObject *types = PyList_New(0);
    for (size_t i = 0; types && i < m->size; ++i) {
      PyObject *t = DescriptorRecord(m->types[i]);
      if (!t || PyList_Append(types, t) < 0) Py_CLEAR(types);
      Py_XDECREF(t);
    }
    if (!types || PyList_Append(out, types) < 0) {
      Py_XDECREF(types);
      Py_DECREF(out);
      return nullptr;
    }
    Py_DECREF(types);
    m = m->next;
  } while (m != first);
  return out;
}

// descriptor_address(type_name): identity of the shared record
PyObject *descriptor_address(PyObject *, PyObject *arg) {
  swig_type_info *ty = Descriptor(arg);
  return ty ? PyLong_FromVoidPtr(ty) : nullptr;
}

// load_plugin(name, path) -> a VObject for a plug-in the host has loaded
PyObject *load_plugin(PyObject *, PyObject *args) {
  const char *name, *path;
  if (!PyArg_ParseTuple(args, "ss", &name, &path)) return nullptr;
  swig_type_info *ty = swigrt::TypeQuery("_p_VObject");
  if (!ty) return PyErr_Format(PyExc_LookupError, "no type descriptor for VObject");
  return swigrt::NewPointerObj(nullptr, new VObject(standin::loadPlugin(name, path)), ty,
                               SWIG_POINTER_OWN);
}

PyObject *unload_all_plugins(PyObject *, PyObject *) {
  standin::unloadAllPlugins();
  Py_RETURN_NONE;
}

// update_output_list(list, items): rewrites `list` as an entry point does
// with an output list the host filled with `items`.
PyObject *update_output_list(PyObject *, PyObject *args) {
  PyObject *list, *items;
  if (!PyArg_ParseTuple(args, "OO!", &list, &PyList_Type, &items)) return nullptr;
  VStringArray array;
  for (Py_ssize_t i = 0; i < PyList_GET_SIZE(items); ++i) {
    const char *text = PyUnicode_AsUTF8(PyList_GET_ITEM(items, i));
    if (!text) return nullptr;
    array.append(text);
  }
  if (!swigrt::UpdateOutputList(list, array, "Argument 3 must be a list object",
                                "Unable to modify argument 3 to return results"))
    return nullptr;
  Py_RETURN_NONE;
}

template <long (*Count)(const char *)>
PyObject *counter(PyObject *, PyObject *arg) {
  const char *cls = PyUnicode_AsUTF8(arg);
  return cls ? PyLong_FromLong(Count(cls)) : nullptr;
}

PyMethodDef methods[] = {
    {"convert_ptr", convert_ptr, METH_VARARGS, "ConvertPtr as a sibling module calls it."},
    {"check_ptr", check_ptr, METH_VARARGS, "ConvertPtr without an output pointer."},
    {"new_pointer_obj", new_pointer_obj, METH_VARARGS, "NewPointerObj for an address."},
    {"new_packed", new_packed, METH_VARARGS, "A packed object of the given bytes."},
    {"type_query", type_query, METH_O, "TypeQuery: (name, readable) or None."},
    {"cast_list", cast_list, METH_O, "Source types of a cast list, in current order."},
    {"modules", modules, METH_NOARGS, "Descriptors of every module sharing the table."},
    {"descriptor_address", descriptor_address, METH_O, "Address of a shared descriptor."},
    {"load_plugin", load_plugin, METH_VARARGS, "Loads a plug-in in the host: its VObject."},
    {"unload_all_plugins", unload_all_plugins, METH_NOARGS, "Unloads every plug-in."},
    {"update_output_list", update_output_list, METH_VARARGS, "Rewrites an output list."},
    {"alive", counter<standin::aliveCount>, METH_O, "Host objects of a class alive now."},
    {"constructed", counter<standin::constructedCount>, METH_O, "Host objects constructed."},
    {"destroyed", counter<standin::destroyedCount>, METH_O, "Host objects destroyed."},
    {nullptr, nullptr, 0, nullptr}};

PyModuleDef module_def = {PyModuleDef_HEAD_INIT, "vorlatesthost", "Plays the host in tests.", -1,
                          methods, nullptr, nullptr, nullptr, nullptr};

}  // namespace

extern "C" __attribute__((visibility("default"))) PyObject *PyInit_vorlatesthost() {
  return PyModule_Create(&module_def);
}
