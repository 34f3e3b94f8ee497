// VPxTransformationMatrix: construction, copying and the shared identity and type id.
#include <openvorla/VPxTransformationMatrix.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxTransformationMatrix::VPxTransformationMatrix() {
  standin::noteConstructed("VPxTransformationMatrix");
}
VPxTransformationMatrix::VPxTransformationMatrix(const VPxTransformationMatrix &) {
  standin::noteConstructed("VPxTransformationMatrix");
}
VPxTransformationMatrix::~VPxTransformationMatrix() {
  standin::noteDestroyed("VPxTransformationMatrix");
}
VPxTransformationMatrix &VPxTransformationMatrix::operator=(const VPxTransformationMatrix &) {
  return *this;
}

const VPxTransformationMatrix VPxTransformationMatrix::identity;
VTypeId VPxTransformationMatrix::baseTransformationMatrixId(0x70000);

OPENVORLA_NAMESPACE_CLOSE
