// VFnData and VFnNumericData: the data function sets, which the stand-in
// needs for their kinds of data only.
#include <openvorla/VFnData.h>
#include <openvorla/VFnNumericData.h>

OPENVORLA_NAMESPACE_OPEN

VFnData::VFnData() = default;
VFnData::~VFnData() = default;
VFn::Type VFnData::type() const { return VFn::kData; }
const char *VFnData::className() { return "VFnData"; }

VFnNumericData::VFnNumericData() = default;
VFnNumericData::~VFnNumericData() = default;
const char *VFnNumericData::className() { return "VFnNumericData"; }

OPENVORLA_NAMESPACE_CLOSE
