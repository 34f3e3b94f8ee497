// TpythonInterpreter: reporting of Python exceptions to the application log,
// saying where they happened.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>

#include <basekit/Tlog.h>
#include <standin/Operation.h>

#include "Engine.h"

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

// A new reference to the attribute, or null with no error set.
PyObject *attribute(PyObject *object, const char *name) {
  PyObject *value = object ? PyObject_GetAttrString(object, name) : nullptr;
  if (!value) PyErr_Clear();
  return value;
}

std::string utf8Of(PyObject *text) {
  std::string out;
  if (text && PyUnicode_Check(text)) {
    Py_INCREF(text);
    if (!takeUtf8(text, out)) PyErr_Clear();
  }
  return out;
}

std::string attributeText(PyObject *object, const char *name) {
  PyObject *value = attribute(object, name);
  std::string text = utf8Of(value);
  Py_XDECREF(value);
  return text;
}

// "Class.method" for a function with a `self`, else the function's
// qualified name.
std::string methodOf(PyObject *self, const std::string &method) {
  return attributeText(reinterpret_cast<PyObject *>(Py_TYPE(self)), "__qualname__") + "." + method;
}

// The code the host called into: the traceback's outermost frame, which is
// the plug-in's method (with the class of its `self`) or function. Empty
// when the exception left no Python frame.
std::string whereFromTraceback(PyObject *traceback) {
  PyObject *frame = attribute(traceback, "tb_frame");
  PyObject *code = attribute(frame, "f_code");
  std::string where;
  if (code) {
    where = attributeText(code, "co_qualname");
    PyObject *names = attribute(code, "co_varnames");
    PyObject *count = attribute(code, "co_argcount");
    if (names && PyTuple_Check(names) && PyTuple_GET_SIZE(names) > 0 && count &&
        PyLong_AsLong(count) > 0 && utf8Of(PyTuple_GET_ITEM(names, 0)) == "self") {
      PyObject *locals = attribute(frame, "f_locals");
      PyObject *self = locals && PyDict_Check(locals) ? PyDict_GetItemString(locals, "self")
                                                      : nullptr;  // borrowed
      if (self) where = methodOf(self, attributeText(code, "co_name"));
      Py_XDECREF(locals);
    }
    PyErr_Clear();
    Py_XDECREF(names);
    Py_XDECREF(count);
  }
  Py_XDECREF(code);
  Py_XDECREF(frame);
  return where;
}

// The exception's last line as a traceback shows it: "ValueError: bad input".
std::string summaryOf(PyObject *type, PyObject *value) {
  auto *cls = reinterpret_cast<PyObject *>(type);
  std::string name = attributeText(cls, "__qualname__");
  std::string module = attributeText(cls, "__module__");
  if (!module.empty() && module != "builtins" && module != "__main__") name = module + "." + name;
  std::string text;
  PyObject *message = nullptr;
  if (value && PyErr_GivenExceptionMatches(value, PyExc_SyntaxError))
    message = attribute(value, "msg");  // without the file and line, shown apart
  if (message && PyUnicode_Check(message))
    text = utf8Of(message);
  else if (value && !takeUtf8(PyObject_Str(value), text))
    text = "<exception str() failed>";
  Py_XDECREF(message);
  PyErr_Clear();
  return text.empty() ? name : name + ": " + text;
}

}  // namespace

namespace scriptrunner {

void reportException(const std::string &fallback) {
  PyObject *type, *value, *traceback;
  PyErr_Fetch(&type, &value, &traceback);
  PyErr_NormalizeException(&type, &value, &traceback);
  if (value && traceback) PyException_SetTraceback(value, traceback);
  std::string text = formatException(type, value, traceback);

  // Where it happened: the plug-in and what the host was doing from the
  // host's operation; the code from the traceback, or, when the exception
  // left no Python frame (a method the plug-in did not define), from the
  // object and method the host was calling.
  standin::Operation *operation = standin::Operation::current();
  standin::Operation::Description described;
  if (operation) described = operation->describe();
  std::string where = traceback ? whereFromTraceback(traceback) : std::string();
  if (where.empty() && operation && operation->method()) {
    PyObject *self = instanceAt(operation->object());
    where = self ? methodOf(self, operation->method()) : operation->method();
    Py_XDECREF(self);
  }
  if (where.empty()) where = fallback;
  std::string header = "Python exception in plug-in";
  if (!described.plugin.empty()) header += " '" + described.plugin + "'";
  if (!where.empty()) header += ", in " + where;
  if (!described.doing.empty()) header += ", " + described.doing;
  if (operation) operation->noteFailure(summaryOf(type, value));
  PyErr_Clear();

  Py_XDECREF(type);
  Py_XDECREF(value);
  Py_XDECREF(traceback);
  Tlog::write(header + ":\n" + text);
}

}  // namespace scriptrunner

TpythonInterpreter &TpythonInterpreter::interpreter() {
  static TpythonInterpreter instance;
  return instance;
}

bool TpythonInterpreter::catchAndReportException() {
  TpythonLock lock;
  if (!PyErr_Occurred()) return false;
  scriptrunner::reportException(std::string());
  return true;
}
