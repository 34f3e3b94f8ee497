// Python sequences read into host values, host numbers made into nested
// lists, and the subscripts of a value class read as Python reads a list's.
//
// A reader takes a borrowed object and fails with no Python error pending, so
// that its caller (an argument conversion, an overload test) says what went
// wrong. Text (str, bytes, bytearray) is never a sequence of numbers here. A
// numpy array of doubles in C order is read through the buffer protocol,
// without an object per number; any other sequence item by item.
#pragma once

#include <cstring>
#include <initializer_list>
#include <type_traits>
#include <vector>

#include "args.h"
#include "errors.h"
#include "numbers.h"
#include "swigrt.h"

namespace swigrt {

// The items of a sequence of at most `max` items, held as a list or tuple.
// False when `obj` is no sequence (code() is then SWIG_TypeError) or a longer
// one (SWIG_MemoryError: no host array could hold it).
class SequenceItems {
 public:
  SequenceItems(PyObject *obj, Py_ssize_t max);
  ~SequenceItems() { Py_XDECREF(fast_); }
  SequenceItems(const SequenceItems &) = delete;
  SequenceItems &operator=(const SequenceItems &) = delete;
  explicit operator bool() const { return fast_ != nullptr; }
  Py_ssize_t size() const { return PySequence_Fast_GET_SIZE(fast_); }
  PyObject *operator[](Py_ssize_t i) const { return PySequence_Fast_GET_ITEM(fast_, i); }
  int code() const { return code_; }

 private:
  PyObject *fast_ = nullptr;
  int code_ = SWIG_TypeError;
};

// The doubles of a buffer in C order with `rank` dimensions; false for any
// other object or buffer.
class DoubleBuffer {
 public:
  DoubleBuffer(PyObject *obj, int rank);
  ~DoubleBuffer() {
    if (held_) PyBuffer_Release(&view_);
  }
  DoubleBuffer(const DoubleBuffer &) = delete;
  DoubleBuffer &operator=(const DoubleBuffer &) = delete;
  explicit operator bool() const { return held_; }
  const double *data() const { return static_cast<const double *>(view_.buf); }
  Py_ssize_t dim(int k) const { return view_.shape[k]; }

 private:
  Py_buffer view_{};
  bool held_ = false;
};

// Between `min` and `max` numbers into `out`; their count, or -1.
template <class T>
Py_ssize_t ReadNumbers(PyObject *obj, T *out, Py_ssize_t min, Py_ssize_t max,
                       int (*convert)(PyObject *, T *)) {
  if constexpr (std::is_same_v<T, double>) {
    DoubleBuffer buffer(obj, 1);
    if (buffer) {
      Py_ssize_t n = buffer.dim(0);
      if (n < min || n > max) return -1;
      std::memcpy(out, buffer.data(), static_cast<size_t>(n) * sizeof(double));
      return n;
    }
  }
  SequenceItems items(obj, max);
  if (!items || items.size() < min) return -1;
  for (Py_ssize_t i = 0; i < items.size(); ++i)
    if (!SWIG_IsOK(convert(items[i], out + i))) return -1;
  return items.size();
}

// Nested sequences of numbers with exactly the dimensions `dims` into `out`,
// row after row.
template <class T>
bool ReadGrid(PyObject *obj, T *out, const Py_ssize_t *dims, int rank,
              int (*convert)(PyObject *, T *)) {
  if constexpr (std::is_same_v<T, double>) {
    DoubleBuffer buffer(obj, rank);
    if (buffer) {
      size_t count = 1;
      for (int k = 0; k < rank; ++k) {
        if (buffer.dim(k) != dims[k]) return false;
        count *= static_cast<size_t>(dims[k]);
      }
      std::memcpy(out, buffer.data(), count * sizeof(double));
      return true;
    }
  }
  SequenceItems items(obj, dims[0]);
  if (!items || items.size() != dims[0]) return false;
  Py_ssize_t stride = 1;
  for (int k = 1; k < rank; ++k) stride *= dims[k];
  for (Py_ssize_t i = 0; i < dims[0]; ++i) {
    bool ok = rank == 1 ? SWIG_IsOK(convert(items[i], out + i))
                        : ReadGrid(items[i], out + i * stride, dims + 1, rank - 1, convert);
    if (!ok) return false;
  }
  return true;
}

template <class T>
bool ReadGrid(PyObject *obj, T *out, std::initializer_list<Py_ssize_t> dims,
              int (*convert)(PyObject *, T *)) {
  return ReadGrid(obj, out, dims.begin(), static_cast<int>(dims.size()), convert);
}

// Nested lists of the numbers of a grid, each made by `make`.
template <class T, class Make>
PyObject *GridList(const T *values, const Py_ssize_t *dims, int rank, Make make) {
  PyObject *list = PyList_New(dims[0]);
  if (!list) return nullptr;
  Py_ssize_t stride = 1;
  for (int k = 1; k < rank; ++k) stride *= dims[k];
  for (Py_ssize_t i = 0; i < dims[0]; ++i) {
    PyObject *item = rank == 1 ? make(values[i])
                               : GridList(values + i * stride, dims + 1, rank - 1, make);
    if (!item) {
      Py_DECREF(list);
      return nullptr;
    }
    PyList_SET_ITEM(list, i, item);
  }
  return list;
}

template <class T, class Make>
PyObject *GridList(const T *values, std::initializer_list<Py_ssize_t> dims, Make make) {
  return GridList(values, dims.begin(), static_cast<int>(dims.size()), make);
}

// An argument that is an array of numbers: a wrapped pointer to its first row
// as before, or nested sequences of its dimensions read into `local`. None is
// refused as a null reference.
template <class T>
bool GridArg(PyObject *obj, swig_type_info *ty, void **out, T *local,
             std::initializer_list<Py_ssize_t> dims, int (*convert)(PyObject *, T *),
             const char *message, const char *null_message) {
  int res = ConvertPtr(obj, out, ty, 0);
  if (SWIG_IsOK(res) && *out) return true;
  if (SWIG_IsOK(res)) {
    SetErrorMessage(ErrorTypeFor(SWIG_ValueError), null_message);
    return false;
  }
  if (ReadGrid(obj, local, dims, convert)) {
    *out = local;
    return true;
  }
  SetErrorMessage(ErrorTypeFor(SWIG_ArgError(res)), message);
  return false;
}

template <class T>
bool GridCheck(PyObject *obj, swig_type_info *ty, std::initializer_list<Py_ssize_t> dims,
               int (*convert)(PyObject *, T *)) {
  if (SWIG_IsOK(ConvertPtr(obj, nullptr, ty, SWIG_POINTER_NO_NULL))) return true;
  size_t count = 1;
  for (Py_ssize_t d : dims) count *= static_cast<size_t>(d);
  std::vector<T> local(count);
  return ReadGrid(obj, local.data(), dims, convert);
}

// An argument of a class that a sequence of its shape stands for: a wrapped
// object of the class, or a sequence that `read` makes into `local`. None is
// refused as a null reference, whatever `read` would make of it.
template <class T>
bool ValueArg(PyObject *obj, swig_type_info *ty, void **out, T &local,
              int (*read)(PyObject *, T *), const char *message, const char *null_message) {
  // A list or tuple is no wrapped object: it is read without looking for one.
  const bool listed = PyList_Check(obj) || PyTuple_Check(obj);
  if (!listed && DirectPointer(obj, ty, out)) return true;
  int res = listed ? SWIG_TypeError : ConvertPtr(obj, out, ty, 0);
  if (SWIG_IsOK(res) && *out) return true;
  if (SWIG_IsOK(res)) {
    SetErrorMessage(ErrorTypeFor(SWIG_ValueError), null_message);
    return false;
  }
  int code = read(obj, &local);
  if (SWIG_IsOK(code)) {
    *out = &local;
    return true;
  }
  SetErrorMessage(ErrorTypeFor(code == SWIG_MemoryError ? code : SWIG_ArgError(res)), message);
  return false;
}

template <class T>
bool ValueCheck(PyObject *obj, swig_type_info *ty, int (*read)(PyObject *, T *)) {
  if (PyList_Check(obj) || PyTuple_Check(obj)) return SWIG_IsOK(read(obj, nullptr));
  return SWIG_IsOK(ConvertPtr(obj, nullptr, ty, SWIG_POINTER_NO_NULL)) ||
         (obj != Py_None && SWIG_IsOK(read(obj, nullptr)));
}

// An operand of an operator: a wrapped object of the class, nothing else.
inline bool OperandPointer(PyObject *obj, swig_type_info *ty, void **out) {
  if (DirectPointer(obj, ty, out)) return true;
  if (obj == Py_None || PyList_Check(obj) || PyTuple_Check(obj) || PyFloat_Check(obj) ||
      PyLong_Check(obj) || PyUnicode_Check(obj))
    return false;
  return SWIG_IsOK(ConvertPtr(obj, out, ty, 0)) && *out;
}

// An item of a sequence read into an array: a wrapped object of the element
// class, or (when `read` is given) a sequence it makes into `local`. The
// element, or null.
template <class T>
const T *ElementOf(PyObject *item, swig_type_info *ty, T &local, int (*read)(PyObject *, T *)) {
  void *ptr = nullptr;
  if (SWIG_IsOK(ConvertPtr(item, &ptr, ty, 0))) return static_cast<const T *>(ptr);
  if (item != Py_None && SWIG_IsOK(read(item, &local))) return &local;
  return nullptr;
}

template <class T>
const T *ElementOf(PyObject *item, swig_type_info *ty, T &) {
  void *ptr = nullptr;
  if (SWIG_IsOK(ConvertPtr(item, &ptr, ty, 0))) return static_cast<const T *>(ptr);
  return nullptr;
}

// --- subscripts ---------------------------------------------------------------

// The integer `key` is, counting a negative one from the end later: false
// with TypeError ("<cls> indices must be <what>, not <type>") set, or
// IndexError for one too large for any sequence.
bool IndexOf(PyObject *key, const char *cls, const char *what, Py_ssize_t *index);

// `*index` within `length` items, a negative one counted from the end; false
// with IndexError ("<cls> index out of range") set.
bool InRange(Py_ssize_t *index, Py_ssize_t length, const char *cls);

// Both: the position `key` names in a sequence of `length` items.
inline bool ItemIndex(PyObject *key, Py_ssize_t length, const char *cls, const char *what,
                      Py_ssize_t *index) {
  return IndexOf(key, cls, what, index) && InRange(index, length, cls);
}

// The positions a tuple of `rank` integers names in a grid of `dims`.
bool GridIndex(PyObject *key, const Py_ssize_t *dims, int rank, const char *cls,
               const char *what, Py_ssize_t *at);

// self[key] for an integer (`item` of its position) or a slice (a list).
template <class Item>
PyObject *GetItem(PyObject *key, Py_ssize_t length, const char *cls, const char *what,
                  Item item) {
  if (PySlice_Check(key)) {
    Py_ssize_t start = 0, stop = 0, step = 0;
    if (PySlice_Unpack(key, &start, &stop, &step) < 0) return nullptr;
    Py_ssize_t n = PySlice_AdjustIndices(length, &start, &stop, step);
    PyObject *list = PyList_New(n);
    if (!list) return nullptr;
    for (Py_ssize_t k = 0; k < n; ++k) {
      PyObject *value = item(start + k * step);
      if (!value) {
        Py_DECREF(list);
        return nullptr;
      }
      PyList_SET_ITEM(list, k, value);
    }
    return list;
  }
  Py_ssize_t i = 0;
  if (!ItemIndex(key, length, cls, what, &i)) return nullptr;
  return item(i);
}

// A tuple of `n` items, each made by `item`.
template <class Item>
PyObject *TupleOf(Py_ssize_t n, Item item) {
  PyObject *tuple = PyTuple_New(n);
  if (!tuple) return nullptr;
  for (Py_ssize_t k = 0; k < n; ++k) {
    PyObject *value = item(k);
    if (!value) {
      Py_DECREF(tuple);
      return nullptr;
    }
    PyTuple_SET_ITEM(tuple, k, value);
  }
  return tuple;
}

// The bound check of a call within a grid: IndexError when an index is not
// below its dimension.
bool WithinBounds(std::initializer_list<unsigned long> at, const Py_ssize_t *dims,
                  const char *cls);

// A result and the arrays the host filled: the arrays replace None, and
// follow anything else in a tuple. Consumes every reference.
PyObject *WithOutputs(PyObject *result, std::initializer_list<PyObject *> outputs);

}  // namespace swigrt
