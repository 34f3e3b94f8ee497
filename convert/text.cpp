// Host strings, string arrays, status values and `char *` text.
#include "text.h"

#include <climits>
#include <cstring>

#include "errors.h"

namespace swigrt {

PyObject *FromStringArray(const StringArrayType &array) {
  const TstringArray &items = TapiCast::stringArray(const_cast<StringArrayType &>(array));
  int n = items.length();
  PyObject *list = PyList_New(n);
  if (!list) return nullptr;
  for (int i = 0; i < n; ++i) {
    const Tstring &item = items[static_cast<unsigned int>(i)];
    PyList_SET_ITEM(list, i, PyUnicode_FromWideChar(item.asW(), item.numChars()));
  }
  return list;
}

bool DirectText(PyObject *str, Tstring &out) {
  wchar_t buffer[128];
  Py_ssize_t n = PyUnicode_GET_LENGTH(str);
  if (n < static_cast<Py_ssize_t>(sizeof buffer / sizeof buffer[0])) {
    if (PyUnicode_AsWideChar(str, buffer, n) != n) {
      PyErr_Clear();
      return false;
    }
    out.set(buffer, static_cast<size_t>(n));
    return true;
  }
  Py_ssize_t size = 0;
  wchar_t *text = PyUnicode_AsWideCharString(str, &size);
  if (!text) {
    PyErr_Clear();
    return false;
  }
  out.set(text, static_cast<size_t>(size));
  PyMem_Free(text);
  return true;
}

namespace {

swig_type_info *StringDescriptor() {
  static bool looked_up = false;
  static swig_type_info *descriptor = nullptr;
  if (!looked_up) {
    descriptor = TypeQuery("_p_VString");
    looked_up = true;
  }
  return descriptor;
}

const StringType *WrappedString(PyObject *obj) {
  swig_type_info *ty = StringDescriptor();
  void *ptr = nullptr;
  if (!ty || PyUnicode_Check(obj) || !SWIG_IsOK(ConvertPtr(obj, &ptr, ty, 0))) return nullptr;
  return static_cast<const StringType *>(ptr);
}

}  // namespace

bool IsText(PyObject *obj) { return PyUnicode_Check(obj) || WrappedString(obj); }

bool StrictStringArg(PyObject *obj, StringType &out, const char *message) {
  if (PyUnicode_Check(obj)) {
    Tstring &text = out;
    if (DirectText(obj, text)) return true;
  } else if (const StringType *s = WrappedString(obj)) {
    out = *s;
    return true;
  }
  PyErr_SetString(PyExc_TypeError, message);
  return false;
}

bool IsTextList(PyObject *obj) {
  if (!PyList_Check(obj) && !PyTuple_Check(obj)) return false;
  PyObject *fast = PySequence_Fast(obj, "");
  if (!fast) {
    PyErr_Clear();
    return false;
  }
  bool ok = true;
  for (Py_ssize_t i = 0; ok && i < PySequence_Fast_GET_SIZE(fast); ++i)
    ok = IsText(PySequence_Fast_GET_ITEM(fast, i));
  Py_DECREF(fast);
  return ok;
}

bool StrictStringArrayArg(PyObject *obj, StringArrayType &out, const char *message) {
  if (!IsTextList(obj)) {
    PyErr_SetString(PyExc_TypeError, message);
    return false;
  }
  PyObject *fast = PySequence_Fast(obj, "");
  if (!fast) return false;
  bool ok = true;
  for (Py_ssize_t i = 0; ok && i < PySequence_Fast_GET_SIZE(fast); ++i) {
    StringType item;
    ok = StrictStringArg(PySequence_Fast_GET_ITEM(fast, i), item, message) &&
         !out.append(item).error();
  }
  Py_DECREF(fast);
  if (!ok && !PyErr_Occurred()) PyErr_SetString(PyExc_TypeError, message);
  return ok;
}

PyObject *UnknownString() {
  static PyObject *unknown = PyUnicode_InternFromString("unknown");
  return unknown;
}

void RaiseStatus(const StatusType &status) {
  StringType text = status.errorString();
  PyObject *value = PyUnicode_FromString(text.asUTF8());
  if (!value) return;
  PyErr_SetObject(PyExc_RuntimeError, value);
  Py_DECREF(value);
}

bool StatusSucceeded(const StatusType &status) {
  if (!status.error()) return true;
  RaiseStatus(status);
  return false;
}

swig_type_info *CharDescriptor() {
  static bool looked_up = false;
  static swig_type_info *descriptor = nullptr;
  if (!looked_up) {
    descriptor = TypeQuery("_p_char");
    looked_up = true;
  }
  return descriptor;
}

int AsCharPtr(PyObject *obj, CharsArg *out) {
  if (PyUnicode_Check(obj)) {
    Py_ssize_t len = 0;
    const char *bytes = PyUnicode_AsUTF8AndSize(obj, &len);
    if (!bytes) {
      PyErr_Clear();
      return SWIG_TypeError;
    }
    if (out) {
      out->ptr = new char[len + 1];
      std::memcpy(out->ptr, bytes, len + 1);
      out->owned = true;
    }
    return SWIG_OK;
  }
  swig_type_info *ty = CharDescriptor();
  void *ptr = nullptr;
  if (!ty || !SWIG_IsOK(ConvertPtr(obj, out ? &ptr : nullptr, ty, 0))) return SWIG_TypeError;
  if (out) out->ptr = static_cast<char *>(ptr);
  return SWIG_OK;
}

PyObject *FromCharPtr(const char *text) {
  if (!text) Py_RETURN_NONE;
  size_t len = std::strlen(text);
  if (len < static_cast<size_t>(INT_MAX))
    return PyUnicode_DecodeUTF8(text, static_cast<Py_ssize_t>(len), "surrogateescape");
  if (swig_type_info *ty = CharDescriptor())
    return NewPointerObj(nullptr, const_cast<char *>(text), ty, 0);
  Py_RETURN_NONE;
}

bool UpdateOutputList(PyObject *list, StringArrayType &array, const char *not_a_list,
                      const char *cannot_modify) {
  if (!PyList_Check(list)) {
    PyErr_SetString(PyExc_TypeError, not_a_list);
    return false;
  }
  TstringArray &items = TapiCast::stringArray(array);
  Py_ssize_t size = PyList_GET_SIZE(list);
  Py_ssize_t n = items.length();
  bool ok = size <= n || PyList_SetSlice(list, n, size, nullptr) == 0;
  TpythonObjectWithLock value;
  for (Py_ssize_t i = 0; ok && i < n; ++i) {
    value.setValue(items[static_cast<unsigned int>(i)]);
    PyObject *item = value.object();
    if (!item) {
      ok = false;
    } else if (i >= size) {
      ok = PyList_Append(list, item) == 0;
    } else {
      // The list takes a reference of its own; the engine object keeps its.
      Py_INCREF(item);
      ok = PyList_SetItem(list, i, item) == 0;
    }
  }
  if (!ok) PyErr_SetString(PyExc_TypeError, cannot_modify);
  return ok;
}

}  // namespace swigrt
