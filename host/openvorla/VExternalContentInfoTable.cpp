// VExternalContentInfoTable: construction and destruction.
#include <openvorla/VExternalContentInfoTable.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VExternalContentInfoTable::VExternalContentInfoTable() {
  standin::noteConstructed("VExternalContentInfoTable");
}
VExternalContentInfoTable::~VExternalContentInfoTable() {
  standin::noteDestroyed("VExternalContentInfoTable");
}

OPENVORLA_NAMESPACE_CLOSE
