// VItGeometry: iteration over the points a deformer moves.
#include <openvorla/VItGeometry.h>

OPENVORLA_NAMESPACE_OPEN

VItGeometry::VItGeometry() : fIndex(0) {}
VItGeometry::VItGeometry(const VPointArray &points) : fPoints(points), fIndex(0) {}
VItGeometry::VItGeometry(const VItGeometry &other) = default;
VItGeometry::~VItGeometry() = default;
VItGeometry &VItGeometry::operator=(const VItGeometry &other) = default;

bool VItGeometry::isDone() const { return fIndex >= fPoints.length(); }

VStatus VItGeometry::next() {
  if (isDone()) return VStatus::kFailure;
  ++fIndex;
  return VStatus::kSuccess;
}

VStatus VItGeometry::reset() {
  fIndex = 0;
  return VStatus::kSuccess;
}

int VItGeometry::index() const { return static_cast<int>(fIndex); }
int VItGeometry::count() const { return static_cast<int>(fPoints.length()); }

VPoint VItGeometry::position(VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = isDone() ? VStatus::kFailure : VStatus::kSuccess;
  return isDone() ? VPoint() : fPoints[fIndex];
}

VStatus VItGeometry::setPosition(const VPoint &point) {
  if (isDone()) return VStatus::kFailure;
  return fPoints.set(point, fIndex);
}

VStatus VItGeometry::allPositions(VPointArray &points) const {
  points = fPoints;
  return VStatus::kSuccess;
}

VStatus VItGeometry::setAllPositions(const VPointArray &points) {
  if (points.length() != fPoints.length()) return VStatus::kInvalidParameter;
  fPoints = points;
  return VStatus::kSuccess;
}

OPENVORLA_NAMESPACE_CLOSE
