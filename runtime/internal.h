// Declarations shared between the runtime's own sources; not for generated code.
#pragma once

#include "swigrt.h"

namespace swigrt {
namespace detail {

// The capsule of the shared table, whichever module installed it, or null
// when there is none. Borrowed.
PyObject *TableCapsule();
// Counts the owning wrappers that hold it (each holds one reference).
void NoteCapsuleHeld(PyObject *capsule);
void NoteCapsuleReleased();

// Makes an object of this module's SwigPyObject type hold a reference on the
// table capsule if it does not hold one yet (see SwigPyObject::table).
void HoldTable(SwigPyObject *sobj);

// The body of the "append" method, shared with <Class>_swiginit.
PyObject *AppendThis(PyObject *self, PyObject *obj);

// Client records are made by <Class>_swigregister and freed by the capsule.
SwigPyClientData *NewClientData(PyObject *klass);
void DeleteClientData(SwigPyClientData *data);

// Drops the runtime's own reference to the global-variable link.
void ReleaseGlobals();

}  // namespace detail
}  // namespace swigrt
