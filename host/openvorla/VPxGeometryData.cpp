// VPxGeometryData: the host's default geometry data behaviour.
#include <openvorla/VPxGeometryData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxGeometryData::VPxGeometryData() : fHasMatrix(false) {
  standin::noteConstructed("VPxGeometryData");
}

VPxGeometryData::~VPxGeometryData() { standin::noteDestroyed("VPxGeometryData"); }

VPxGeometryIterator *VPxGeometryData::iterator(VObjectArray &, VObject &, bool) { return nullptr; }

VPxGeometryIterator *VPxGeometryData::iterator(VObjectArray &, VObject &, bool, bool) const {
  return nullptr;
}

bool VPxGeometryData::updateCompleteVertexGroup(VObject &) const { return false; }
bool VPxGeometryData::deleteComponent(const VObjectArray &) { return false; }

bool VPxGeometryData::deleteComponentsFromGroups(const VObjectArray &, VIntArray &, VObjectArray &,
                                                 VObject &) {
  return false;
}

void VPxGeometryData::smartCopy(const VPxGeometryData *srcGeom) {
  if (srcGeom) copy(*srcGeom);
}

VStatus VPxGeometryData::setMatrix(const VMatrix &matrix) {
  fMatrix = matrix;
  fHasMatrix = true;
  return VStatus::kSuccess;
}

bool VPxGeometryData::matrix(VMatrix &matrix) const {
  matrix = fMatrix;
  return fHasMatrix;
}

OPENVORLA_NAMESPACE_CLOSE
