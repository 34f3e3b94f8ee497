// Host strings, string arrays and status values across the boundary, and
// `char *` text. Strings and arrays go through the host scripting engine.
//
// A string argument that does not convert sets TypeError and the call goes
// on with an empty value: the host engine's conversions have always worked
// that way, and plug-ins rely on the host running regardless. A module whose
// scalars are strict stops the call instead (the Strict routines).
#pragma once

#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>
#include <scriptrunner/TapiCast.h>
#include <scriptrunner/TpythonObjectWithLock.h>

#include "swigrt.h"

namespace swigrt {

using StringType = OPENVORLA_NAMESPACE::VString;
using StringArrayType = OPENVORLA_NAMESPACE::VStringArray;
using StatusType = OPENVORLA_NAMESPACE::VStatus;

// The text of an exact `str`, converted here rather than through the
// scripting engine (which converts a str no differently) so that the common
// case does not take the re-entrant interpreter lock again.
bool DirectText(PyObject *str, Tstring &out);

inline void StringArg(PyObject *obj, StringType &out, const char *message) {
  if (PyUnicode_CheckExact(obj) && DirectText(obj, out)) return;
  TpythonObjectWithLock value(obj);
  if (!value.getValue(static_cast<Tstring &>(out))) PyErr_SetString(PyExc_TypeError, message);
}

inline void StringArrayArg(PyObject *obj, StringArrayType &out, const char *message) {
  TpythonObjectWithLock value(obj);
  if (!value.getValue(TapiCast::stringArray(out))) PyErr_SetString(PyExc_TypeError, message);
}

inline PyObject *FromString(const StringType &s) {
  const Tstring &text = s;
  return PyUnicode_FromWideChar(text.asW(), text.numChars());
}

PyObject *FromStringArray(const StringArrayType &array);

// Strict text: a str, or a wrapped host string. False, with TypeError and
// `message` set, for anything else; nothing is left pending.
bool IsText(PyObject *obj);
bool StrictStringArg(PyObject *obj, StringType &out, const char *message);
// A list or tuple of such text.
bool IsTextList(PyObject *obj);
bool StrictStringArrayArg(PyObject *obj, StringArrayType &out, const char *message);

// The interned "unknown", which a status of code 5 becomes.
PyObject *UnknownString();

// Sets RuntimeError with the status's error text.
void RaiseStatus(const StatusType &status);

// None for success, "unknown" for code 5, otherwise null with RuntimeError
// carrying the host's error text.
inline PyObject *StatusResult(const StatusType &status) {
  if (!status.error()) Py_RETURN_NONE;
  if (status.statusCode() == StatusType::kUnknownParameter) {
    PyObject *unknown = UnknownString();
    Py_INCREF(unknown);
    return unknown;
  }
  RaiseStatus(status);
  return nullptr;
}

// For a status reported through a pointer: false, with RuntimeError set,
// for any failure (code 5 included).
bool StatusSucceeded(const StatusType &status);

// A `char *` argument: a str is copied to a new buffer for the call, a
// wrapped `char` pointer is used as it is. The holder frees what it made.
struct CharsArg {
  char *ptr = nullptr;
  bool owned = false;
  CharsArg() = default;
  CharsArg(const CharsArg &) = delete;
  CharsArg &operator=(const CharsArg &) = delete;
  ~CharsArg() {
    if (owned) delete[] ptr;
  }
};
int AsCharPtr(PyObject *obj, CharsArg *out);
PyObject *FromCharPtr(const char *text);
swig_type_info *CharDescriptor();

// Rewrites the list argument in place with the array's strings.
bool UpdateOutputList(PyObject *list, StringArrayType &array, const char *not_a_list,
                      const char *cannot_modify);

}  // namespace swigrt
