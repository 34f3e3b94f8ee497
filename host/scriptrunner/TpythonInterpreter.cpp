// TpythonInterpreter: reporting of Python exceptions to the application log.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>

#include <basekit/Tlog.h>

#include <string>

namespace {

// UTF-8 of a str, with unencodable characters escaped; steals the reference.
bool takeUtf8(PyObject *text, std::string &out) {
  if (!text) return false;
  PyObject *bytes = PyUnicode_AsEncodedString(text, "utf-8", "backslashreplace");
  Py_DECREF(text);
  if (!bytes) return false;
  out.assign(PyBytes_AS_STRING(bytes), static_cast<size_t>(PyBytes_GET_SIZE(bytes)));
  Py_DECREF(bytes);
  return true;
}

// The exception as traceback.format_exception shows it, or str() of the value
// when that fails. Errors raised while formatting are cleared.
std::string formatException(PyObject *type, PyObject *value, PyObject *traceback) {
  std::string text;
  PyObject *module = PyImport_ImportModule("traceback");
  PyObject *lines =
      module ? PyObject_CallMethod(module, "format_exception", "OOO", type, value ? value : Py_None,
                                   traceback ? traceback : Py_None)
             : nullptr;
  Py_XDECREF(module);
  PyObject *empty = lines ? PyUnicode_FromString("") : nullptr;
  bool formatted = empty && takeUtf8(PyUnicode_Join(empty, lines), text);
  Py_XDECREF(empty);
  Py_XDECREF(lines);
  if (!formatted) {
    PyErr_Clear();
    if (!value || !takeUtf8(PyObject_Str(value), text)) text = "<exception could not be formatted>";
  }
  PyErr_Clear();
  while (!text.empty() && text.back() == '\n') text.pop_back();
  return text;
}

}  // namespace

TpythonInterpreter &TpythonInterpreter::interpreter() {
  static TpythonInterpreter instance;
  return instance;
}

bool TpythonInterpreter::catchAndReportException() {
  TpythonLock lock;
  if (!PyErr_Occurred()) return false;
  PyObject *type, *value, *traceback;
  PyErr_Fetch(&type, &value, &traceback);
  PyErr_NormalizeException(&type, &value, &traceback);
  if (value && traceback) PyException_SetTraceback(value, traceback);
  std::string text = formatException(type, value, traceback);
  Py_XDECREF(type);
  Py_XDECREF(value);
  Py_XDECREF(traceback);
  Tlog::write("Python exception in plug-in:\n" + text);
  return true;
}
