// bench_floor: the entry points of the call benchmark written by hand, as
// directly as the C API allows, to measure the generated ones against.
//
// Each function has the calling form of its generated counterpart and does
// the same work: the same argument count rules, a real type check of every
// wrapped argument, the same conversions and host call, the same result.
// What it leaves out is only what the work does not need.
#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxNode.h>
#include <standin/Plugins.h>

#include "swigrt.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

// Learnt by setup() from a wrapper that _OpenVorlaVPx made.
PyTypeObject *wrapper_type = nullptr;
PyObject *this_name = nullptr;
swig_type_info *node_type = nullptr;
swig_type_info *command_type = nullptr;
swig_type_info *plugin_type = nullptr;

// The C++ object behind `obj`, which must be of type `ty`. The common case is
// read straight off the wrapper under the instance's "this"; anything else
// (a subclass's type, chained wrappers, a sibling module's wrapper, None)
// goes through the runtime's full conversion.
void *Pointer(PyObject *obj, swig_type_info *ty, bool allow_null) {
  PyObject *wrapper = obj;
  if (Py_TYPE(obj) != wrapper_type) {
    wrapper = PyObject_GenericGetAttr(obj, this_name);
    if (wrapper) {
      Py_DECREF(wrapper);  // the instance keeps it alive
    } else {
      PyErr_Clear();
    }
  }
  if (wrapper && Py_TYPE(wrapper) == wrapper_type) {
    auto *sobj = reinterpret_cast<SwigPyObject *>(wrapper);
    if (sobj->ty == ty && sobj->ptr) return sobj->ptr;
  }
  void *ptr = nullptr;
  if (!SWIG_IsOK(swigrt::ConvertPtr(obj, &ptr, ty, 0))) {
    PyErr_Format(PyExc_TypeError, "expected %s", ty->str ? ty->str : ty->name);
    return nullptr;
  }
  if (!ptr && !allow_null) PyErr_Format(PyExc_ValueError, "null %s", ty->name);
  return ptr;
}

template <class T>
T *Self(PyObject *obj, swig_type_info *ty) {
  return static_cast<T *>(Pointer(obj, ty, false));
}

// str -> host string; false with TypeError for anything else.
bool Text(PyObject *obj, VString &out) {
  if (!PyUnicode_Check(obj)) {
    PyErr_SetString(PyExc_TypeError, "expected a str");
    return false;
  }
  Py_ssize_t size = 0;
  wchar_t *text = PyUnicode_AsWideCharString(obj, &size);
  if (!text) return false;
  static_cast<Tstring &>(out).set(text, static_cast<size_t>(size));
  PyMem_Free(text);
  return true;
}

bool Count(PyObject *args, const char *name, Py_ssize_t min, Py_ssize_t max) {
  Py_ssize_t n = PyTuple_GET_SIZE(args);
  if (n >= min && n <= max) return true;
  PyErr_Format(PyExc_TypeError, "%s takes %zd to %zd arguments (%zd given)", name, min, max, n);
  return false;
}

PyObject *registeringCallableScript(PyObject *, PyObject *) {
  return PyBool_FromLong(VFnPlugin::registeringCallableScript());
}

PyObject *isAbstractClass(PyObject *, PyObject *arg) {
  auto *node = Self<VPxNode>(arg, node_type);
  if (!node) return nullptr;
  return PyBool_FromLong(node->isAbstractClass());
}

PyObject *getFilesToArchive(PyObject *, PyObject *args) {
  if (!Count(args, "getFilesToArchive", 1, 4)) return nullptr;
  auto *node = Self<VPxNode>(PyTuple_GET_ITEM(args, 0), node_type);
  if (!node) return nullptr;
  bool flags[3] = {false, false, false};
  for (Py_ssize_t i = 1; i < PyTuple_GET_SIZE(args); ++i) {
    int truth = PyObject_IsTrue(PyTuple_GET_ITEM(args, i));
    if (truth < 0) return nullptr;
    flags[i - 1] = truth;
  }
  VStringArray files = node->getFilesToArchive(flags[0], flags[1], flags[2]);
  unsigned int n = files.length();
  PyObject *list = PyList_New(n);
  for (unsigned int i = 0; list && i < n; ++i) {
    VString file = files[i];
    PyObject *item = PyUnicode_FromWideChar(file.asWChar(), file.numChars());
    if (!item) Py_CLEAR(list);
    else PyList_SET_ITEM(list, i, item);
  }
  return list;
}

PyObject *copyInternalData(PyObject *, PyObject *args) {
  if (!Count(args, "copyInternalData", 2, 2)) return nullptr;
  auto *node = Self<VPxNode>(PyTuple_GET_ITEM(args, 0), node_type);
  if (!node) return nullptr;
  PyObject *arg = PyTuple_GET_ITEM(args, 1);
  void *other = nullptr;
  if (arg != Py_None) {
    other = Pointer(arg, node_type, true);
    if (!other && PyErr_Occurred()) return nullptr;
  }
  node->copyInternalData(static_cast<VPxNode *>(other));
  Py_RETURN_NONE;
}

PyObject *setCommandString(PyObject *, PyObject *args) {
  if (!Count(args, "setCommandString", 2, 2)) return nullptr;
  auto *command = Self<VPxCommand>(PyTuple_GET_ITEM(args, 0), command_type);
  VString text;
  if (!command || !Text(PyTuple_GET_ITEM(args, 1), text)) return nullptr;
  command->setCommandString(text);
  Py_RETURN_NONE;
}

PyObject *setVersion(PyObject *, PyObject *args) {
  if (!Count(args, "setVersion", 2, 2)) return nullptr;
  auto *plugin = Self<VFnPlugin>(PyTuple_GET_ITEM(args, 0), plugin_type);
  VString text;
  if (!plugin || !Text(PyTuple_GET_ITEM(args, 1), text)) return nullptr;
  VStatus status = plugin->setVersion(text);
  if (!status.error()) Py_RETURN_NONE;
  if (status.statusCode() == VStatus::kUnknownParameter) return PyUnicode_FromString("unknown");
  PyErr_SetString(PyExc_RuntimeError, status.errorString().asUTF8());
  return nullptr;
}

swig_type_info *Descriptor(const char *name) {
  swig_type_info *ty = swigrt::TypeQuery(name);
  if (!ty) PyErr_Format(PyExc_LookupError, "no type descriptor %s", name);
  return ty;
}

// setup(wrapper): learns the wrapper type from one of _OpenVorlaVPx's wrappers
// and looks the descriptors up in the shared table.
PyObject *setup(PyObject *, PyObject *wrapper) {
  if (!swigrt::SwigPyObject_Check(wrapper)) {
    PyErr_SetString(PyExc_TypeError, "setup() takes a wrapper (the 'this' of a proxy)");
    return nullptr;
  }
  wrapper_type = Py_TYPE(wrapper);
  if (!this_name && !(this_name = PyUnicode_InternFromString("this"))) return nullptr;
  if (!(node_type = Descriptor("_p_VPxNode")) || !(command_type = Descriptor("_p_VPxCommand")) ||
      !(plugin_type = Descriptor("_p_VFnPlugin")))
    return nullptr;
  Py_RETURN_NONE;
}

// load_plugin(name) -> the host's plug-in object of a newly loaded plug-in,
// wrapped as the package's VObject; Python has no way to make one.
PyObject *load_plugin(PyObject *, PyObject *arg) {
  const char *name = PyUnicode_AsUTF8(arg);
  swig_type_info *ty = name ? Descriptor("_p_VObject") : nullptr;
  if (!ty) return nullptr;
  auto *object = new VObject(standin::loadPlugin(name, "bench"));
  return swigrt::NewPointerObj(nullptr, object, ty, SWIG_POINTER_OWN);
}

PyMethodDef methods[] = {
    {"setup", setup, METH_O, nullptr},
    {"load_plugin", load_plugin, METH_O, nullptr},
    {"registeringCallableScript", registeringCallableScript, METH_NOARGS, nullptr},
    {"isAbstractClass", isAbstractClass, METH_O, nullptr},
    {"getFilesToArchive", getFilesToArchive, METH_VARARGS, nullptr},
    {"copyInternalData", copyInternalData, METH_VARARGS, nullptr},
    {"setCommandString", setCommandString, METH_VARARGS, nullptr},
    {"setVersion", setVersion, METH_VARARGS, nullptr},
    {nullptr, nullptr, 0, nullptr}};

PyModuleDef module = {PyModuleDef_HEAD_INIT, "bench_floor", nullptr, -1, methods,
                      nullptr, nullptr, nullptr, nullptr};

}  // namespace

PyMODINIT_FUNC PyInit_bench_floor() { return PyModule_Create(&module); }
