// What a value class shows and hashes: the text of its repr, and a hash
// combined from what its accessors read.
#pragma once

#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <initializer_list>

namespace swigrt {

// The repr of a value, built part by part: "Name(a, b)" for a call,
// "<Name a=1 b=2>" for a state. Each add() consumes the value it is given
// (null when making it failed) and returns false, with the error set, when the
// repr cannot be made; finish() then is not called.
class ValueText {
 public:
  enum Form { kCall, kState };
  ValueText(const char *name, Form form);
  ~ValueText() { Py_XDECREF(parts_); }
  ValueText(const ValueText &) = delete;
  ValueText &operator=(const ValueText &) = delete;
  bool add(PyObject *value);                      // repr(value)
  bool add(const char *label, PyObject *value);   // label=repr(value)
  bool addHex(unsigned long value);               // 0x7a200
  bool addHex(const char *label, unsigned long value);
  PyObject *finish();

 private:
  bool append(const char *label, PyObject *text);
  const char *name_;
  Form form_;
  PyObject *parts_;
};

// "Name([a, b, c])" for the `length` items `item` makes, with the middle of a
// long run left out ("[a, b, c, ..., x, y, z]").
template <class Item>
PyObject *ListRepr(const char *name, Py_ssize_t length, Item item);

// A hash of the values an object's accessors read, each already hashed.
Py_hash_t HashCombine(std::initializer_list<Py_hash_t> hashes);

// The hash of an integer or boolean an accessor reads.
Py_hash_t HashNumber(long long value);

// --- implementation ---------------------------------------------------------

constexpr Py_ssize_t kReprEdge = 3;
constexpr Py_ssize_t kReprLimit = 1000;

PyObject *JoinedRepr(const char *name, PyObject *items, bool elided);

template <class Item>
PyObject *ListRepr(const char *name, Py_ssize_t length, Item item) {
  const bool elided = length > kReprLimit;
  PyObject *items = PyList_New(0);
  if (!items) return nullptr;
  for (Py_ssize_t i = 0; i < length; ++i) {
    if (elided && i == kReprEdge) i = length - kReprEdge;
    PyObject *value = item(i);
    PyObject *text = value ? PyObject_Repr(value) : nullptr;
    Py_XDECREF(value);
    if (!text || PyList_Append(items, text) < 0) {
      Py_XDECREF(text);
      Py_DECREF(items);
      return nullptr;
    }
    Py_DECREF(text);
  }
  PyObject *out = JoinedRepr(name, items, elided);
  Py_DECREF(items);
  return out;
}

}  // namespace swigrt
