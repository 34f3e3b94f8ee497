// VExternalContentLocationTable: construction and destruction.
#include <openvorla/VExternalContentLocationTable.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VExternalContentLocationTable::VExternalContentLocationTable() {
  standin::noteConstructed("VExternalContentLocationTable");
}
VExternalContentLocationTable::~VExternalContentLocationTable() {
  standin::noteDestroyed("VExternalContentLocationTable");
}

OPENVORLA_NAMESPACE_CLOSE
