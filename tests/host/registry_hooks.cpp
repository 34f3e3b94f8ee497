// The application's side of plug-in registration, for tests: what the host
// recorded, and instances made through the registered creators.
#include "registry_hooks.h"

#include <standin/Registry.h>

#include "swigrt.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

PyObject *Wrap(void *object, const char *type) {
  if (!object) Py_RETURN_NONE;
  swig_type_info *ty = swigrt::TypeQuery(type);
  if (!ty) return PyErr_Format(PyExc_LookupError, "no type descriptor for %s", type);
  // The host owns what it made: the wrapper never does.
  return swigrt::NewPointerObj(nullptr, object, ty, 0);
}

template <class T>
T *Unwrap(PyObject *obj, const char *type) {
  swig_type_info *ty = swigrt::TypeQuery(type);
  void *ptr = nullptr;
  if (!ty || !SWIG_IsOK(swigrt::ConvertPtr(obj, &ptr, ty, 0)) || !ptr) {
    PyErr_Format(PyExc_TypeError, "expected a wrapped %s", type);
    return nullptr;
  }
  return static_cast<T *>(ptr);
}

}  // namespace

PyObject *registrations(PyObject *, PyObject *) {
  PyObject *out = PyList_New(0);
  for (const auto &r : standin::registrations()) {
    PyObject *item = Py_BuildValue(
        "{s:s,s:s,s:s,s:s,s:s,s:I,s:I,s:i,s:i}", "kind", r.kind.c_str(), "name", r.name.c_str(),
        "second", r.secondName.c_str(), "classification", r.classification.c_str(), "plugin",
        r.plugin.c_str(), "type_id", r.typeId, "second_type_id", r.secondTypeId, "flags", r.flags,
        "script_callables", r.scriptCallables());
    if (!item || PyList_Append(out, item) < 0) {
      Py_XDECREF(item);
      Py_DECREF(out);
      return nullptr;
    }
    Py_DECREF(item);
  }
  return out;
}

PyObject *announcements(PyObject *, PyObject *) { return PyLong_FromLong(standin::announcements()); }

PyObject *reset_announcements(PyObject *, PyObject *) {
  standin::resetAnnouncements();
  Py_RETURN_NONE;
}

PyObject *initialize_node(PyObject *, PyObject *arg) {
  const char *name = PyUnicode_AsUTF8(arg);
  if (!name) return nullptr;
  return PyLong_FromLong(standin::initializeNode(name).statusCode());
}

PyObject *create_node(PyObject *, PyObject *arg) {
  const char *name = PyUnicode_AsUTF8(arg);
  return name ? Wrap(standin::createNode(name), "_p_VPxNode") : nullptr;
}

PyObject *create_command(PyObject *, PyObject *arg) {
  const char *name = PyUnicode_AsUTF8(arg);
  return name ? Wrap(standin::createCommand(name), "_p_VPxCommand") : nullptr;
}

PyObject *delete_node(PyObject *, PyObject *arg) {
  auto *node = Unwrap<VPxNode>(arg, "_p_VPxNode");
  if (!node) return nullptr;
  Py_BEGIN_ALLOW_THREADS standin::deleteNode(node);
  Py_END_ALLOW_THREADS Py_RETURN_NONE;
}

PyObject *delete_command(PyObject *, PyObject *arg) {
  auto *command = Unwrap<VPxCommand>(arg, "_p_VPxCommand");
  if (!command) return nullptr;
  Py_BEGIN_ALLOW_THREADS standin::deleteCommand(command);
  Py_END_ALLOW_THREADS Py_RETURN_NONE;
}
