// VFnTransform: the transform function set of the stand-in.
#include <openvorla/VFnTransform.h>

OPENVORLA_NAMESPACE_OPEN

VFnTransform::VFnTransform() = default;
VFnTransform::VFnTransform(const VObject &object) : VFnBase(object) {}
VFnTransform::~VFnTransform() = default;
VFn::Type VFnTransform::type() const { return VFn::kTransform; }

OPENVORLA_NAMESPACE_CLOSE
