// Director base: what every SwigDirector_<Class> shares, its ownership records
// and the exceptions a director throws into the host.
//
// Ownership handshake. A director starts out owned by Python: the instance's
// "this" wrapper owns the C++ object and `swig_self` is borrowed, so the
// Python instance can die and take the director with it. When the host is to
// keep the object, Python disowns the wrapper and calls swig_disown(): from
// then on the director holds exactly one reference on `swig_self`, and the
// Python instance lives until the host deletes the C++ object. There is no
// way back, and a second swig_disown() takes no second reference.
//
// The lock. The host may delete or call a director from any of its threads,
// so every director operation that touches a Python object holds a
// TpythonLock, and nothing else here takes the interpreter lock. The members
// below that change reference counts or the Python error indicator
// (swig_disown, swig_incref, the exception constructors) expect the caller
// to hold it already: they run inside entry points or forwarded calls.
#pragma once

#ifndef PY_SSIZE_T_CLEAN
#define PY_SSIZE_T_CLEAN
#endif
#include <Python.h>

#include <exception>
#include <map>
#include <memory>
#include <string>
#include <typeinfo>

namespace Swig {

// A record of something a forwarded call handed to C++, kept as long as the
// director that received it.
class GCItem {
 public:
  virtual ~GCItem() = default;
  virtual int get_own() const { return 0; }
};

// Owns one GCItem (or none) and deletes it when replaced or destroyed.
class GCItem_var {
 public:
  GCItem_var(GCItem *item = nullptr) : _item(item) {}
  GCItem_var &operator=(GCItem *item) {
    _item.reset(item);
    return *this;
  }
  GCItem *operator->() const { return _item.get(); }
  GCItem *get() const { return _item.get(); }

 private:
  std::unique_ptr<GCItem> _item;
};

// An object that Python handed to C++, with the ownership flag its wrapper
// had; the object itself is not ours to delete.
class GCItem_Object : public GCItem {
 public:
  explicit GCItem_Object(int own) : _own(own) {}
  int get_own() const override { return _own; }

 private:
  int _own;
};

// A buffer allocated with new[] for a result that the host only borrows.
template <typename Type>
class GCArray_T : public GCItem {
 public:
  explicit GCArray_T(Type *ptr) : _ptr(ptr) {}
  ~GCArray_T() override { delete[] _ptr; }
  GCArray_T(const GCArray_T &) = delete;
  GCArray_T &operator=(const GCArray_T &) = delete;

 private:
  Type *_ptr;
};

class Director {
 public:
  // `self` is borrowed until swig_disown().
  explicit Director(PyObject *self) : swig_self(self) {}
  virtual ~Director();
  Director(const Director &) = delete;
  Director &operator=(const Director &) = delete;

  // Null when the Python subclass never ran its base class's __init__.
  PyObject *swig_get_self() const { return swig_self; }

  void swig_disown() const {
    if (!swig_disown_flag) {
      swig_disown_flag = true;
      swig_incref();
    }
  }

  void swig_incref() const {
    if (swig_disown_flag) Py_XINCREF(swig_self);
  }

  // Whether Python may call the protected member `name` right now. The bare
  // base puts no limit; a director with protected members answers from its
  // own table.
  virtual bool swig_get_inner(const char * /*name*/) const { return true; }
  virtual void swig_set_inner(const char * /*name*/, bool /*value*/) const {}

  // Called by the director class's destructor with the address its wrappers
  // hold: the Python instance's "this" stops pointing at the object, so that
  // a plug-in that kept the instance gets an error, not a dangling pointer.
  void swig_forget_object(void *object) const;

  // Keep a text buffer, or the record of an object that an override handed
  // to the host, alive as long as this director. A pointer already recorded
  // keeps its first record.
  void swig_acquire_ownership_array(char *ptr) const;
  void swig_acquire_ownership_obj(void *ptr, int own) const;

 protected:
  mutable std::map<void *, GCItem_var> swig_owner;

 private:
  PyObject *swig_self;
  mutable bool swig_disown_flag = false;
};

// The director behind a host object, or null. An object of exactly the host
// class is none, which the type test tells without the cost of a cross-cast.
template <class T>
Director *DirectorOf(T *object) {
  if (!object) return nullptr;
  // The host exports its classes' type information, so the same object
  // answers the common case without comparing names.
  const std::type_info &type = typeid(*object);
  if (&type == &typeid(T) || type == typeid(T)) return nullptr;
  return dynamic_cast<Director *>(object);
}

// Thrown into the host when a forwarded call cannot produce its result. The
// Python error indicator carries the same text, so the entry point that
// catches it (or whoever checks next) finds a proper Python exception.
class DirectorException : public std::exception {
 public:
  // The message is `hdr`, or `hdr` and `msg` separated by one blank. Sets
  // `error` with that message unless an error is already pending: the first
  // error is the one that explains what went wrong.
  explicit DirectorException(PyObject *error, const char *hdr = "", const char *msg = "");

  const char *what() const noexcept override { return swig_msg.c_str(); }

  // RuntimeError with `msg` ("'self' uninitialized, ...").
  [[noreturn]] static void raise(const char *msg);

 protected:
  std::string swig_msg;
};

// An upcall reached a base method that has no implementation.
class DirectorPureVirtualException : public DirectorException {
 public:
  // `msg`: the qualified method name, "VPxData::copy".
  explicit DirectorPureVirtualException(const char *msg = "");
  [[noreturn]] static void raise(const char *msg);
};

// A Python override returned something that does not convert to the C++
// result type.
class DirectorTypeMismatchException : public DirectorException {
 public:
  // `msg`: the detail, "in output value of type 'bool'".
  explicit DirectorTypeMismatchException(PyObject *error, const char *msg = "");
  [[noreturn]] static void raise(PyObject *error, const char *msg);
};

}  // namespace Swig
