// TpythonObjectWithLock: conversions between Python str and the engine strings.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonObjectWithLock.h>

namespace {

bool stringFrom(PyObject *object, Tstring &value) {
  if (!PyUnicode_Check(object)) return false;
  Py_ssize_t size = 0;
  wchar_t *text = PyUnicode_AsWideCharString(object, &size);
  if (!text) {
    PyErr_Clear();
    return false;
  }
  value.set(text, static_cast<size_t>(size));
  PyMem_Free(text);
  return true;
}

}  // namespace

TpythonObjectWithLock::TpythonObjectWithLock() : fObject(nullptr) {}

TpythonObjectWithLock::TpythonObjectWithLock(PyObject *object) : fObject(object) {
  Py_XINCREF(fObject);
}

TpythonObjectWithLock::~TpythonObjectWithLock() { Py_XDECREF(fObject); }

bool TpythonObjectWithLock::getValue(Tstring &value) const {
  return fObject && stringFrom(fObject, value);
}

bool TpythonObjectWithLock::getValue(TstringArray &value) const {
  if (!fObject || !(PyList_Check(fObject) || PyTuple_Check(fObject))) return false;
  value.clear();
  for (Py_ssize_t i = 0; i < PySequence_Fast_GET_SIZE(fObject); ++i) {
    Tstring item;
    if (!stringFrom(PySequence_Fast_GET_ITEM(fObject, i), item)) return false;
    value.append(item);
  }
  return true;
}

void TpythonObjectWithLock::setValue(const Tstring &value) {
  PyObject *text = PyUnicode_FromWideChar(value.asW(), static_cast<Py_ssize_t>(value.numChars()));
  Py_XDECREF(fObject);
  fObject = text;
}
