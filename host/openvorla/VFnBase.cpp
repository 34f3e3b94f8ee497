// VFnBase: the common part of the function sets.
#include <openvorla/VFnBase.h>

OPENVORLA_NAMESPACE_OPEN

VFnBase::VFnBase() = default;
VFnBase::VFnBase(const VObject &object) : fObject(object) {}
VFnBase::~VFnBase() = default;
VFn::Type VFnBase::type() const { return VFn::kBase; }
VObject VFnBase::object() const { return fObject; }
void VFnBase::setObject(const VObject &object) { fObject = object; }
bool VFnBase::hasObj(VFn::Type type) const { return type == this->type(); }

OPENVORLA_NAMESPACE_CLOSE
