// Director base: destruction under the interpreter lock, ownership records and
// the director exceptions.
#include "director.h"

#include "swigrt.h"

#include <scriptrunner/TpythonLock.h>

namespace Swig {

// The host deletes directors from any thread, with or without the interpreter
// lock. Dropping the last reference may run the Python instance's
// deallocation, so the lock is held around it. The records in `swig_owner`
// hold no Python objects and are destroyed after the lock is gone.
Director::~Director() {
  TpythonLock lock;
  if (swig_disown_flag) Py_XDECREF(swig_self);
}

void Director::swig_forget_object(void *object) const {
  // An instance whose last reference is going is being deallocated, and its
  // wrapper with it; there is nothing left to tell.
  if (!swig_self || Py_REFCNT(swig_self) <= 0) return;
  // The generic lookup reads the instance's attributes where they are, also
  // while a collection is clearing them, and never builds anything.
  PyObject *type, *value, *traceback;
  PyErr_Fetch(&type, &value, &traceback);
  PyObject *wrapper = PyObject_GenericGetAttr(swig_self, swigrt::ThisString());
  if (wrapper) {
    swigrt::ForgetPointer(wrapper, object);
    Py_DECREF(wrapper);
  }
  PyErr_Clear();
  PyErr_Restore(type, value, traceback);
}

// Each record is made only once its slot is known to be free: a second holder
// for a recorded buffer would free the buffer that the first one still owns.
void Director::swig_acquire_ownership_array(char *ptr) const {
  if (!ptr) return;
  auto slot = swig_owner.lower_bound(ptr);
  if (slot != swig_owner.end() && slot->first == ptr) return;
  swig_owner.emplace_hint(slot, ptr, new GCArray_T<char>(ptr));
}

void Director::swig_acquire_ownership_obj(void *ptr, int own) const {
  if (!ptr || !own) return;
  auto slot = swig_owner.lower_bound(ptr);
  if (slot != swig_owner.end() && slot->first == ptr) return;
  swig_owner.emplace_hint(slot, ptr, new GCItem_Object(own));
}

DirectorException::DirectorException(PyObject *error, const char *hdr, const char *msg)
    : swig_msg(hdr ? hdr : "") {
  if (msg && *msg) {
    swig_msg += ' ';
    swig_msg += msg;
  }
  if (!PyErr_Occurred()) PyErr_SetString(error ? error : PyExc_RuntimeError, what());
}

void DirectorException::raise(const char *msg) { throw DirectorException(PyExc_RuntimeError, msg); }

DirectorPureVirtualException::DirectorPureVirtualException(const char *msg)
    : DirectorException(PyExc_RuntimeError, "SWIG director pure virtual method called", msg) {}

void DirectorPureVirtualException::raise(const char *msg) {
  throw DirectorPureVirtualException(msg);
}

DirectorTypeMismatchException::DirectorTypeMismatchException(PyObject *error, const char *msg)
    : DirectorException(error, "SWIG director type mismatch", msg) {}

void DirectorTypeMismatchException::raise(PyObject *error, const char *msg) {
  throw DirectorTypeMismatchException(error, msg);
}

}  // namespace Swig
