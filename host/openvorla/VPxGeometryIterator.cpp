// VPxGeometryIterator: the host's index walk over a geometry.
#include <openvorla/VPxGeometryIterator.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxGeometryIterator::VPxGeometryIterator(void *userGeometry, VObjectArray &)
    : fGeometry(userGeometry), fShape(nullptr), fCurrent(0), fMax(0) {
  standin::noteConstructed("VPxGeometryIterator");
}

VPxGeometryIterator::VPxGeometryIterator(void *userGeometry, VObject &)
    : fGeometry(userGeometry), fShape(nullptr), fCurrent(0), fMax(0) {
  standin::noteConstructed("VPxGeometryIterator");
}

VPxGeometryIterator::~VPxGeometryIterator() { standin::noteDestroyed("VPxGeometryIterator"); }

bool VPxGeometryIterator::isDone() const { return fCurrent >= iteratorCount(); }

VStatus VPxGeometryIterator::next() {
  if (isDone()) return VStatus(VStatus::kFailure, "The iteration is done");
  ++fCurrent;
  return VStatus::kSuccess;
}

VStatus VPxGeometryIterator::reset() {
  fCurrent = 0;
  return VStatus::kSuccess;
}

void VPxGeometryIterator::component(VObject &) {}
bool VPxGeometryIterator::hasPoints() const { return false; }
bool VPxGeometryIterator::hasNormals() const { return false; }
int VPxGeometryIterator::iteratorCount() const { return fMax; }
VPoint VPxGeometryIterator::point() const { return VPoint(); }
void VPxGeometryIterator::setPoint(const VPoint &) const {}

int VPxGeometryIterator::setPointGetNext(VPoint &point) {
  int set = index();
  setPoint(point);
  next();
  return set;
}

int VPxGeometryIterator::index() const { return fCurrent; }
int VPxGeometryIterator::indexUnsimplified() const { return index(); }
int VPxGeometryIterator::currentPoint() const { return fCurrent; }

VStatus VPxGeometryIterator::setCurrentPoint(int index) {
  if (index < 0) return VStatus(VStatus::kInvalidParameter, "Negative point index");
  fCurrent = index;
  return VStatus::kSuccess;
}

int VPxGeometryIterator::maxPoints() const { return fMax; }

VStatus VPxGeometryIterator::setMaxPoints(int count) {
  if (count < 0) return VStatus(VStatus::kInvalidParameter, "Negative point count");
  fMax = count;
  return VStatus::kSuccess;
}

VStatus VPxGeometryIterator::setObject(VPxSurfaceShape &shape) {
  fShape = &shape;
  return VStatus::kSuccess;
}

VPxSurfaceShape *VPxGeometryIterator::object() const { return fShape; }
void *VPxGeometryIterator::geometry() const { return fGeometry; }
const char *VPxGeometryIterator::className() { return "VPxGeometryIterator"; }

OPENVORLA_NAMESPACE_CLOSE
