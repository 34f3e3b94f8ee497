// The reprs and hashes of value classes.
#include "values.h"

#include <cstdio>

namespace swigrt {

ValueText::ValueText(const char *name, Form form)
    : name_(name), form_(form), parts_(PyList_New(0)) {}

bool ValueText::append(const char *label, PyObject *text) {
  if (!parts_ || !text) {
    Py_XDECREF(text);
    return false;
  }
  if (label) {
    PyObject *labelled = PyUnicode_FromFormat("%s=%U", label, text);
    Py_DECREF(text);
    if (!labelled) return false;
    text = labelled;
  }
  int failed = PyList_Append(parts_, text);
  Py_DECREF(text);
  return failed == 0;
}

bool ValueText::add(PyObject *value) { return add(nullptr, value); }

bool ValueText::add(const char *label, PyObject *value) {
  if (!value) return false;
  PyObject *text = PyObject_Repr(value);
  Py_DECREF(value);
  return append(label, text);
}

bool ValueText::addHex(unsigned long value) { return addHex(nullptr, value); }

bool ValueText::addHex(const char *label, unsigned long value) {
  char text[24];
  std::snprintf(text, sizeof text, "0x%lx", value);
  return append(label, PyUnicode_FromString(text));
}

PyObject *ValueText::finish() {
  if (!parts_) return nullptr;
  PyObject *sep = PyUnicode_FromString(form_ == kCall ? ", " : " ");
  if (!sep) return nullptr;
  PyObject *joined = PyUnicode_Join(sep, parts_);
  Py_DECREF(sep);
  if (!joined) return nullptr;
  PyObject *out = form_ == kCall ? PyUnicode_FromFormat("%s(%U)", name_, joined)
                  : PyList_GET_SIZE(parts_) ? PyUnicode_FromFormat("<%s %U>", name_, joined)
                                            : PyUnicode_FromFormat("<%s>", name_);
  Py_DECREF(joined);
  return out;
}

PyObject *JoinedRepr(const char *name, PyObject *items, bool elided) {
  if (elided) {
    PyObject *dots = PyUnicode_FromString("...");
    if (!dots) return nullptr;
    int failed = PyList_Insert(items, kReprEdge, dots);
    Py_DECREF(dots);
    if (failed) return nullptr;
  }
  PyObject *sep = PyUnicode_FromString(", ");
  if (!sep) return nullptr;
  PyObject *joined = PyUnicode_Join(sep, items);
  Py_DECREF(sep);
  if (!joined) return nullptr;
  PyObject *out = PyUnicode_FromFormat("%s([%U])", name, joined);
  Py_DECREF(joined);
  return out;
}

// The combination of CPython's tuple hash (xxHash's rounds), so that objects
// differing in any one part hash apart.
Py_hash_t HashCombine(std::initializer_list<Py_hash_t> hashes) {
  const Py_uhash_t prime1 = 11400714785074694791ULL;
  const Py_uhash_t prime2 = 14029467366897019727ULL;
  const Py_uhash_t prime5 = 2870177450012600261ULL;
  Py_uhash_t acc = prime5;
  for (Py_hash_t h : hashes) {
    acc += static_cast<Py_uhash_t>(h) * prime2;
    acc = (acc << 31) | (acc >> 33);
    acc *= prime1;
  }
  acc += hashes.size() ^ (prime5 ^ 3527539UL);
  if (acc == static_cast<Py_uhash_t>(-1)) return 1546275796;
  return static_cast<Py_hash_t>(acc);
}

Py_hash_t HashNumber(long long value) {
  return value == -1 ? -2 : static_cast<Py_hash_t>(value);
}

}  // namespace swigrt
