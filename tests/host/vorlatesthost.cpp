// Test-host module: what a test needs to look at the package as the host and
// the sibling modules see it.
#include <standin/Lifetime.h>
#include <standin/Plugins.h>
#include <scriptrunner/TstringId.h>

#include <cstdint>
#include <map>
#include <string>
#include <vector>

#include "director.h"
#include "graph_hooks.h"
#include "drive_calls.h"
#include "host_calls.h"
#include "registry_hooks.h"
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

// A director as the generated ones are built, minus a proxy-class base: a
// test holds it through a capsule and plays the host that owns or deletes it.
class TestDirector : public Swig::Director {
 public:
  explicit TestDirector(PyObject *self) : Swig::Director(self) {}

  bool swig_get_inner(const char *name) const override {
    auto it = swig_inner.find(name);
    return it != swig_inner.end() && it->second;
  }
  void swig_set_inner(const char *name, bool value) const override { swig_inner[name] = value; }

  const std::map<void *, Swig::GCItem_var> &records() const { return swig_owner; }
  void adopt(void *key, Swig::GCItem *item) { swig_owner.emplace(key, item); }

 private:
  mutable std::map<std::string, bool> swig_inner;
};

// Elements of an array that a test lets a director own: their destructors
// show that the record was deleted, and with array delete.
int gCountedDestroyed = 0;
struct Counted {
  ~Counted() { ++gCountedDestroyed; }
};

constexpr char kDirectorCapsule[] = "vorlatesthost.director";
char gDeletedMark;  // capsule context of a handle whose director is gone

Swig::Director *Handle(PyObject *handle) {
  auto *d = static_cast<Swig::Director *>(PyCapsule_GetPointer(handle, kDirectorCapsule));
  if (d && PyCapsule_GetContext(handle) == &gDeletedMark) {
    PyErr_SetString(PyExc_ValueError, "director already deleted");
    return nullptr;
  }
  return d;
}

TestDirector *AsTestDirector(PyObject *handle) {
  return static_cast<TestDirector *>(Handle(handle));
}

PyObject *make_director(PyObject *, PyObject *obj) {
  return PyCapsule_New(static_cast<Swig::Director *>(new TestDirector(obj)), kDirectorCapsule,
                       nullptr);
}

PyObject *director_disown(PyObject *, PyObject *handle) {
  Swig::Director *d = Handle(handle);
  if (!d) return nullptr;
  d->swig_disown();
  Py_RETURN_NONE;
}

// director_delete(h, release_lock=False): the host deletes the object, with
// the interpreter lock released when asked.
PyObject *director_delete(PyObject *, PyObject *args) {
  PyObject *handle;
  int release = 0;
  if (!PyArg_ParseTuple(args, "O|p", &handle, &release)) return nullptr;
  Swig::Director *d = Handle(handle);
  if (!d) return nullptr;
  PyCapsule_SetContext(handle, &gDeletedMark);
  if (release) {
    Py_BEGIN_ALLOW_THREADS delete d;
    Py_END_ALLOW_THREADS
  } else {
    delete d;
  }
  Py_RETURN_NONE;
}

PyObject *director_inner(PyObject *, PyObject *args) {
  PyObject *handle;
  const char *name;
  if (!PyArg_ParseTuple(args, "Os", &handle, &name)) return nullptr;
  Swig::Director *d = Handle(handle);
  return d ? PyBool_FromLong(d->swig_get_inner(name)) : nullptr;
}

PyObject *director_set_inner(PyObject *, PyObject *args) {
  PyObject *handle;
  const char *name;
  int value;
  if (!PyArg_ParseTuple(args, "Osp", &handle, &name, &value)) return nullptr;
  Swig::Director *d = Handle(handle);
  if (!d) return nullptr;
  d->swig_set_inner(name, value);
  Py_RETURN_NONE;
}

// base_inner(name): a bare base, told to close `name`, still answers.
PyObject *base_inner(PyObject *, PyObject *arg) {
  const char *name = PyUnicode_AsUTF8(arg);
  if (!name) return nullptr;
  Swig::Director bare(Py_None);
  const Swig::Director &d = bare;
  d.swig_set_inner(name, false);
  return PyBool_FromLong(d.swig_get_inner(name));
}

// own_array(h, n): records n new text buffers, then each of them again, and null.
PyObject *own_array(PyObject *, PyObject *args) {
  PyObject *handle;
  int n;
  if (!PyArg_ParseTuple(args, "Oi", &handle, &n)) return nullptr;
  Swig::Director *d = Handle(handle);
  if (!d) return nullptr;
  std::vector<char *> buffers;
  for (int i = 0; i < n; ++i) buffers.push_back(new char[8]());
  for (int pass = 0; pass < 2; ++pass)
    for (char *p : buffers) d->swig_acquire_ownership_array(p);
  d->swig_acquire_ownership_array(nullptr);
  Py_RETURN_NONE;
}

// own_object(h, key, own): records the (never dereferenced) address `key`.
PyObject *own_object(PyObject *, PyObject *args) {
  PyObject *handle;
  unsigned long long key;
  int own;
  if (!PyArg_ParseTuple(args, "OKi", &handle, &key, &own)) return nullptr;
  Swig::Director *d = Handle(handle);
  if (!d) return nullptr;
  d->swig_acquire_ownership_obj(reinterpret_cast<void *>(static_cast<uintptr_t>(key)), own);
  Py_RETURN_NONE;
}

// own_counted(h, n): the director owns an array of n Counted elements.
PyObject *own_counted(PyObject *, PyObject *args) {
  PyObject *handle;
  int n;
  if (!PyArg_ParseTuple(args, "Oi", &handle, &n)) return nullptr;
  TestDirector *d = AsTestDirector(handle);
  if (!d) return nullptr;
  Counted *elements = new Counted[n];
  d->adopt(elements, new Swig::GCArray_T<Counted>(elements));
  Py_RETURN_NONE;
}

PyObject *counted_destroyed(PyObject *, PyObject *) { return PyLong_FromLong(gCountedDestroyed); }

// owner_records(h) -> get_own() of every ownership record, in the map's order
PyObject *owner_records(PyObject *, PyObject *handle) {
  TestDirector *d = AsTestDirector(handle);
  if (!d) return nullptr;
  PyObject *out = PyList_New(0);
  for (const auto &record : d->records()) {
    PyObject *own = PyLong_FromLong(record.second->get_own());
    if (!own || PyList_Append(out, own) < 0) Py_CLEAR(out);
    Py_XDECREF(own);
    if (!out) break;
  }
  return out;
}

// director_exception(pending, kind, *args) -> (class, what, error type, error text)
//
// Sets `pending` (an exception instance, or None) as the pending error, then
// throws and catches one director exception:
//   "plain", error, header[, detail]   DirectorException
//   "pure"[, name]                     DirectorPureVirtualException
//   "mismatch", error[, detail]        DirectorTypeMismatchException
//   "raise", header / "raise_pure", name / "raise_mismatch", error, detail
//                                      the class's raise()
// and reports what was caught and what the Python error indicator held,
// which it clears.
PyObject *director_exception(PyObject *, PyObject *args) {
  Py_ssize_t n = PyTuple_GET_SIZE(args);
  if (n < 2) return PyErr_Format(PyExc_TypeError, "expected pending and kind");
  PyObject *pending = PyTuple_GET_ITEM(args, 0);
  const char *kind = PyUnicode_AsUTF8(PyTuple_GET_ITEM(args, 1));
  if (!kind) return nullptr;
  PyObject *rest = PyTuple_GetSlice(args, 2, n);
  if (!rest) return nullptr;
  PyObject *error = nullptr;
  const char *a = "", *b = "";
  const std::string k = kind;
  int parsed;
  if (k == "plain")
    parsed = PyArg_ParseTuple(rest, "Os|s", &error, &a, &b);
  else if (k == "mismatch" || k == "raise_mismatch")
    parsed = PyArg_ParseTuple(rest, "O|s", &error, &b);
  else if (k == "pure" || k == "raise" || k == "raise_pure")
    parsed = PyArg_ParseTuple(rest, "|s", &a);
  else
    parsed = (PyErr_Format(PyExc_ValueError, "unknown kind '%s'", kind), 0);
  if (!parsed) {
    Py_DECREF(rest);
    return nullptr;
  }
  if (pending != Py_None) PyErr_SetObject(reinterpret_cast<PyObject *>(Py_TYPE(pending)), pending);

  const char *caught = "nothing";
  std::string what;
  try {
    if (k == "plain") throw Swig::DirectorException(error, a, b);
    if (k == "pure") throw Swig::DirectorPureVirtualException(a);
    if (k == "mismatch") throw Swig::DirectorTypeMismatchException(error, b);
    if (k == "raise") Swig::DirectorException::raise(a);
    if (k == "raise_pure") Swig::DirectorPureVirtualException::raise(a);
    Swig::DirectorTypeMismatchException::raise(error, b);
  } catch (const Swig::DirectorPureVirtualException &e) {
    caught = "DirectorPureVirtualException";
    what = e.what();
  } catch (const Swig::DirectorTypeMismatchException &e) {
    caught = "DirectorTypeMismatchException";
    what = e.what();
  } catch (const Swig::DirectorException &e) {
    caught = "DirectorException";
    what = e.what();
  }
  Py_DECREF(rest);  // the texts above pointed into it

  PyObject *type, *value, *tb;
  PyErr_Fetch(&type, &value, &tb);
  PyErr_NormalizeException(&type, &value, &tb);
  PyObject *text = value ? PyObject_Str(value) : Py_NewRef(Py_None);
  PyObject *result =
      text ? Py_BuildValue("(ssOO)", caught, what.c_str(), type ? type : Py_None, text) : nullptr;
  Py_XDECREF(text);
  Py_XDECREF(type);
  Py_XDECREF(value);
  Py_XDECREF(tb);
  return result;
}

// string_ids() -> (constructed, destroyed) of the engine's resource identifiers
PyObject *string_ids(PyObject *, PyObject *) {
  return Py_BuildValue("(ii)", TstringId::constructedCount(), TstringId::destroyedCount());
}

// checked_call(fn, args) -> fn(*args), with the check the interpreter makes
// only on some of its call paths: a result returned with an error still set
// becomes SystemError "... returned a result with an exception set", the
// error its cause.
PyObject *checked_call(PyObject *, PyObject *args) {
  PyObject *fn, *arguments;
  if (!PyArg_ParseTuple(args, "OO!", &fn, &PyTuple_Type, &arguments)) return nullptr;
  PyObject *result = PyObject_Call(fn, arguments, nullptr);
  if (result && PyErr_Occurred()) {
    Py_DECREF(result);
    PyObject *type, *value, *tb;
    PyErr_Fetch(&type, &value, &tb);
    PyErr_NormalizeException(&type, &value, &tb);
    PyErr_Format(PyExc_SystemError, "%R returned a result with an exception set", fn);
    PyObject *t2, *v2, *tb2;
    PyErr_Fetch(&t2, &v2, &tb2);
    PyErr_NormalizeException(&t2, &v2, &tb2);
    PyException_SetCause(v2, value);  // steals value
    Py_XDECREF(type);
    Py_XDECREF(tb);
    PyErr_Restore(t2, v2, tb2);
    return nullptr;
  }
  if (!result && !PyErr_Occurred())
    PyErr_Format(PyExc_SystemError, "%R returned NULL without setting an exception", fn);
  return result;
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
    {"call", host_call, METH_VARARGS, "The host calls a virtual operation once."},
    {"call_threads", host_call_threads, METH_VARARGS, "Host threads call an operation."},
    {"host_delete", host_delete, METH_VARARGS, "The host deletes an object it owns."},
    {"log_entries", log_entries, METH_NOARGS, "The application's log."},
    {"clear_log", clear_log, METH_NOARGS, "Empties the application's log."},
    {"registrations", registrations, METH_NOARGS, "What the host's registry recorded."},
    {"announcements", announcements, METH_NOARGS, "Callables announced since the reset."},
    {"reset_announcements", reset_announcements, METH_NOARGS, "Counts announcements anew."},
    {"initialize_node", initialize_node, METH_O, "Runs a node type's initializer: status code."},
    {"create_node", create_node, METH_O, "A node made through its registered creator."},
    {"create_command", create_command, METH_O, "A command made through its creator."},
    {"delete_node", delete_node, METH_O, "The host deletes a node it made."},
    {"delete_command", delete_command, METH_O, "The host deletes a command it made."},
    {"graph_create", graph_create, METH_VARARGS, "Makes a node in the graph: its name."},
    {"graph_delete", graph_delete, METH_O, "Deletes a node of the graph."},
    {"graph_delete_plugin_nodes", graph_delete_plugin_nodes, METH_O,
     "Deletes the nodes of a plug-in's types."},
    {"graph_clear", graph_clear, METH_NOARGS, "Deletes every node of the graph."},
    {"graph_nodes", graph_nodes, METH_NOARGS, "The graph's nodes, with their compute counts."},
    {"graph_set", graph_set, METH_VARARGS, "Sets a plug to a number or a string."},
    {"graph_get", graph_get, METH_O, "A plug's value, computed when dirty."},
    {"graph_connect", graph_connect, METH_VARARGS, "Connects two plugs."},
    {"graph_disconnect", graph_disconnect, METH_VARARGS, "Disconnects two plugs."},
    {"graph_evaluate", graph_evaluate, METH_O, "Computes the dirty values on n threads."},
    {"graph_threads", graph_threads, METH_NOARGS, "The threads the last evaluation used."},
    {"command_run", command_run, METH_VARARGS, "Runs a command: its result as text."},
    {"command_undo", command_undo, METH_NOARGS, "Undoes the last undoable command."},
    {"command_redo", command_redo, METH_NOARGS, "Redoes the last undone command."},
    {"command_flush", command_flush, METH_NOARGS, "Deletes the commands kept for undo."},
    {"export_scene", export_scene, METH_VARARGS, "Writes a scene through a translator."},
    {"import_scene", import_scene, METH_VARARGS, "Reads a scene through a translator."},
    {"round_trip_data", round_trip_data, METH_VARARGS, "Reads, copies, writes a data type."},
    {"checked_call", checked_call, METH_VARARGS, "fn(*args), a result with an error refused."},
    {"drive_count", drive_count, METH_NOARGS, "How many forwarding overrides there are."},
    {"drive_info", drive_info, METH_O, "(class, method, signature) of an override."},
    {"drive", drive_call, METH_VARARGS, "The host calls one forwarding override on an object."},
    {"string_ids", string_ids, METH_NOARGS, "Resource identifiers made and destroyed."},
    {"alive", counter<standin::aliveCount>, METH_O, "Host objects of a class alive now."},
    {"constructed", counter<standin::constructedCount>, METH_O, "Host objects constructed."},
    {"destroyed", counter<standin::destroyedCount>, METH_O, "Host objects destroyed."},
    {"make_director", make_director, METH_O, "A test director for a Python object: a handle."},
    {"director_disown", director_disown, METH_O, "swig_disown() on a handle's director."},
    {"director_delete", director_delete, METH_VARARGS, "Deletes a handle's director as the host."},
    {"director_inner", director_inner, METH_VARARGS, "swig_get_inner(name) of a director."},
    {"director_set_inner", director_set_inner, METH_VARARGS, "swig_set_inner(name, value)."},
    {"base_inner", base_inner, METH_O, "swig_get_inner(name) of a bare Swig::Director."},
    {"own_array", own_array, METH_VARARGS, "Records new text buffers, each twice, and null."},
    {"own_object", own_object, METH_VARARGS, "swig_acquire_ownership_obj(key, own)."},
    {"own_counted", own_counted, METH_VARARGS, "The director owns n counted elements."},
    {"counted_destroyed", counted_destroyed, METH_NOARGS, "Counted elements destroyed so far."},
    {"owner_records", owner_records, METH_O, "get_own() of each ownership record."},
    {"director_exception", director_exception, METH_VARARGS, "Throws and catches one."},
    {nullptr, nullptr, 0, nullptr}};

PyModuleDef module_def = {PyModuleDef_HEAD_INIT, "vorlatesthost", "Plays the host in tests.", -1,
                          methods, nullptr, nullptr, nullptr, nullptr};

}  // namespace

extern "C" __attribute__((visibility("default"))) PyObject *PyInit_vorlatesthost() {
  return PyModule_Create(&module_def);
}
