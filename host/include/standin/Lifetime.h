// Stand-in only, for tests: how many objects of each host class were constructed
// and destroyed. Every constructor and destructor of a host class reports itself
// under its own class name, so building a derived object also counts its bases.
#pragma once

#include <openvorla/VApiVersion.h>

namespace standin {

OPENVORLA_EXPORT void noteConstructed(const char *cls);
OPENVORLA_EXPORT void noteDestroyed(const char *cls);
OPENVORLA_EXPORT long constructedCount(const char *cls);
OPENVORLA_EXPORT long destroyedCount(const char *cls);
OPENVORLA_EXPORT long aliveCount(const char *cls);
OPENVORLA_EXPORT void resetCounts();

}  // namespace standin
