// Stand-in only: host objects made to order, each carrying a name that tests read.
#pragma once

#include <openvorla/VObject.h>

namespace standin {

// A new object, distinct from every other.
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VObject makeObject(OPENVORLA_NAMESPACE::VFn::Type type,
                                                         const char *name);
// The name given to makeObject, or "" for a null object.
OPENVORLA_EXPORT const char *objectName(const OPENVORLA_NAMESPACE::VObject &object);

inline OPENVORLA_NAMESPACE::VObject makeAttribute(const char *name) {
  return makeObject(OPENVORLA_NAMESPACE::VFn::kAttribute, name);
}

}  // namespace standin
