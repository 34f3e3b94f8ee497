// Declarations shared between the runtime's own sources; not for generated code.
#pragma once

#include "swigrt.h"

namespace swigrt {
namespace detail {

// The capsule this module installed as the shared table, or null when the
// module joined a table made by a sibling (or the capsule is gone). Borrowed.
PyObject *TableCapsule();

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
