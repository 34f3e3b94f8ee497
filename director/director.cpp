// Director base: destruction under the interpreter lock, ownership records and
// the director exceptions.
#include "director.h"

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
