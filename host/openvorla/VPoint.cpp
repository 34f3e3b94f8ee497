// VPoint: homogeneous points.
#include <openvorla/VPoint.h>

#include <openvorla/VMatrix.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VPoint::VPoint() : x(0.0), y(0.0), z(0.0), w(1.0) {}
VPoint::VPoint(double xx, double yy, double zz, double ww) : x(xx), y(yy), z(zz), w(ww) {}
VPoint::VPoint(const VVector &v) : x(v.x), y(v.y), z(v.z), w(1.0) {}
VPoint::VPoint(const VPoint &other) = default;
VPoint::~VPoint() = default;
VPoint &VPoint::operator=(const VPoint &other) = default;

double VPoint::operator[](unsigned int index) const {
  return index == 0 ? x : index == 1 ? y : index == 2 ? z : w;
}

double &VPoint::operator[](unsigned int index) {
  return index == 0 ? x : index == 1 ? y : index == 2 ? z : w;
}

// Offsets move the cartesian point, whatever its w.
VPoint VPoint::operator+(const VVector &v) const {
  return VPoint(x + v.x * w, y + v.y * w, z + v.z * w, w);
}
VPoint VPoint::operator-(const VVector &v) const { return *this + -v; }
VVector VPoint::operator-(const VPoint &o) const { return asVector() - o.asVector(); }

VPoint &VPoint::operator+=(const VVector &v) { return *this = *this + v; }
VPoint &VPoint::operator-=(const VVector &v) { return *this = *this - v; }

VPoint VPoint::operator*(const VMatrix &m) const {
  VPoint r;
  for (unsigned int c = 0; c < 4; ++c) r[c] = x * m(0, c) + y * m(1, c) + z * m(2, c) + w * m(3, c);
  return r;
}

VStatus VPoint::cartesianize() {
  if (w == 0.0)
    return VStatus(VStatus::kInvalidParameter, "A point at infinity has no cartesian form");
  x /= w;
  y /= w;
  z /= w;
  w = 1.0;
  return VStatus::kSuccess;
}

double VPoint::distanceTo(const VPoint &other) const { return (*this - other).length(); }

VVector VPoint::asVector() const {
  return w == 1.0 || w == 0.0 ? VVector(x, y, z) : VVector(x / w, y / w, z / w);
}

bool VPoint::isEquivalent(const VPoint &o, double tolerance) const {
  return asVector().isEquivalent(o.asVector(), tolerance);
}

bool VPoint::operator==(const VPoint &o) const {
  return x == o.x && y == o.y && z == o.z && w == o.w;
}
bool VPoint::operator!=(const VPoint &o) const { return !(*this == o); }

OPENVORLA_NAMESPACE_CLOSE
