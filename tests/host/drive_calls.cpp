// The test host calling any forwarding override of any director class, as
// the application would, through the generated table of drive.cpp.
#include "drive_calls.h"

#include <exception>
#include <string>

#include "drive_support.h"

namespace {

// The pending Python error's value, cleared; None when there is none.
PyObject *TakePending() {
  if (!PyErr_Occurred()) return Py_NewRef(Py_None);
  PyObject *type, *value, *tb;
  PyErr_Fetch(&type, &value, &tb);
  PyErr_NormalizeException(&type, &value, &tb);
  Py_XDECREF(type);
  Py_XDECREF(tb);
  return value ? value : Py_NewRef(Py_None);
}

}  // namespace

// drive_count() -> the number of forwarding overrides
PyObject *drive_count(PyObject *, PyObject *) { return PyLong_FromSize_t(drive::call_count); }

// drive_info(k) -> (class, method, the member pointer's C++ type)
PyObject *drive_info(PyObject *, PyObject *arg) {
  Py_ssize_t k = PyLong_AsSsize_t(arg);
  if (k < 0 || static_cast<std::size_t>(k) >= drive::call_count) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_IndexError, "no such override");
    return nullptr;
  }
  const drive::Call &c = drive::calls[k];
  return Py_BuildValue("(sss)", c.cls, c.name, c.signature);
}

// drive(k, obj, samples) -> what the host received, ('ok', value, pending)
// or ('exception', what, pending), with the Python error the call left
// pending (or None), which is cleared.
PyObject *drive_call(PyObject *, PyObject *args) {
  Py_ssize_t k;
  PyObject *obj, *samples;
  if (!PyArg_ParseTuple(args, "nOO!", &k, &obj, &PyDict_Type, &samples)) return nullptr;
  if (k < 0 || static_cast<std::size_t>(k) >= drive::call_count) {
    PyErr_SetString(PyExc_IndexError, "no such override");
    return nullptr;
  }
  const drive::Call &c = drive::calls[k];
  std::string descriptor = std::string("_p_") + c.cls;
  swig_type_info *ty = swigrt::TypeQuery(descriptor.c_str());
  void *object = nullptr;
  if (!ty || !SWIG_IsOK(swigrt::ConvertPtr(obj, &object, ty, 0)) || !object)
    return PyErr_Format(PyExc_TypeError, "expected a %s", c.cls);
  try {
    PyObject *value = c.call(object, samples);
    if (!value) return nullptr;
    return Py_BuildValue("(sNN)", "ok", value, TakePending());
  } catch (const std::exception &e) {
    return Py_BuildValue("(ssN)", "exception", e.what(), TakePending());
  }
}
