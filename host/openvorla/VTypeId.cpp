// VTypeId: plug-in type identifiers.
#include <openvorla/VTypeId.h>

OPENVORLA_NAMESPACE_OPEN

VTypeId::VTypeId() : fId(0) {}
VTypeId::VTypeId(unsigned int id) : fId(id) {}
VTypeId::VTypeId(const VTypeId &other) = default;
VTypeId::~VTypeId() = default;
VTypeId &VTypeId::operator=(const VTypeId &other) = default;
bool VTypeId::operator==(const VTypeId &other) const { return fId == other.fId; }
bool VTypeId::operator!=(const VTypeId &other) const { return fId != other.fId; }
unsigned int VTypeId::id() const { return fId; }

OPENVORLA_NAMESPACE_CLOSE
