// VQuaternion: rotation quaternions.
#include <openvorla/VQuaternion.h>

#include <openvorla/VEulerRotation.h>
#include <openvorla/VMatrix.h>

#include <algorithm>
#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VQuaternion::VQuaternion() : x(0.0), y(0.0), z(0.0), w(1.0) {}
VQuaternion::VQuaternion(double xx, double yy, double zz, double ww) : x(xx), y(yy), z(zz), w(ww) {}
VQuaternion::VQuaternion(double angle, const VVector &axis) : VQuaternion() {
  setAxisAngle(axis, angle);
}

// Shepperd's method on the column-vector form, which is the transpose of ours:
// the largest of w, x, y, z is found first so that no division is by a small value.
VQuaternion::VQuaternion(const VMatrix &m) {
  auto r = [&m](int row, int col) { return m(col, row); };
  double trace = r(0, 0) + r(1, 1) + r(2, 2);
  if (trace > 0.0) {
    double s = 2.0 * std::sqrt(trace + 1.0);
    w = 0.25 * s;
    x = (r(2, 1) - r(1, 2)) / s;
    y = (r(0, 2) - r(2, 0)) / s;
    z = (r(1, 0) - r(0, 1)) / s;
  } else if (r(0, 0) > r(1, 1) && r(0, 0) > r(2, 2)) {
    double s = 2.0 * std::sqrt(1.0 + r(0, 0) - r(1, 1) - r(2, 2));
    w = (r(2, 1) - r(1, 2)) / s;
    x = 0.25 * s;
    y = (r(0, 1) + r(1, 0)) / s;
    z = (r(0, 2) + r(2, 0)) / s;
  } else if (r(1, 1) > r(2, 2)) {
    double s = 2.0 * std::sqrt(1.0 + r(1, 1) - r(0, 0) - r(2, 2));
    w = (r(0, 2) - r(2, 0)) / s;
    x = (r(0, 1) + r(1, 0)) / s;
    y = 0.25 * s;
    z = (r(1, 2) + r(2, 1)) / s;
  } else {
    double s = 2.0 * std::sqrt(1.0 + r(2, 2) - r(0, 0) - r(1, 1));
    w = (r(1, 0) - r(0, 1)) / s;
    x = (r(0, 2) + r(2, 0)) / s;
    y = (r(1, 2) + r(2, 1)) / s;
    z = 0.25 * s;
  }
  normalizeIt();
}

VQuaternion::VQuaternion(const VQuaternion &other) = default;
VQuaternion::~VQuaternion() = default;
VQuaternion &VQuaternion::operator=(const VQuaternion &other) = default;

VQuaternion &VQuaternion::setAxisAngle(const VVector &axis, double angle) {
  VVector unit = axis.normal();
  double s = std::sin(angle / 2.0);
  x = unit.x * s;
  y = unit.y * s;
  z = unit.z * s;
  w = std::cos(angle / 2.0);
  return *this;
}

bool VQuaternion::getAxisAngle(VVector &axis, double &angle) const {
  VQuaternion q = normal();
  double s = std::sqrt(q.x * q.x + q.y * q.y + q.z * q.z);
  if (s < 1.0e-12) {
    axis = VVector(0.0, 0.0, 1.0);
    angle = 0.0;
    return false;
  }
  axis = VVector(q.x / s, q.y / s, q.z / s);
  angle = 2.0 * std::atan2(s, q.w);
  return true;
}

VMatrix VQuaternion::asMatrix() const {
  VQuaternion q = normal();
  double xx = q.x * q.x, yy = q.y * q.y, zz = q.z * q.z;
  double xy = q.x * q.y, xz = q.x * q.z, yz = q.y * q.z;
  double wx = q.w * q.x, wy = q.w * q.y, wz = q.w * q.z;
  VMatrix m;
  m(0, 0) = 1.0 - 2.0 * (yy + zz);
  m(0, 1) = 2.0 * (xy + wz);
  m(0, 2) = 2.0 * (xz - wy);
  m(1, 0) = 2.0 * (xy - wz);
  m(1, 1) = 1.0 - 2.0 * (xx + zz);
  m(1, 2) = 2.0 * (yz + wx);
  m(2, 0) = 2.0 * (xz + wy);
  m(2, 1) = 2.0 * (yz - wx);
  m(2, 2) = 1.0 - 2.0 * (xx + yy);
  return m;
}

VEulerRotation VQuaternion::asEulerRotation() const {
  return VEulerRotation::decompose(asMatrix(), VEulerRotation::kXYZ);
}

// Row vectors apply this rotation first, so the Hamilton product is other * this.
VQuaternion VQuaternion::operator*(const VQuaternion &o) const {
  const VQuaternion &p = o, &q = *this;
  return VQuaternion(
      p.w * q.x + q.w * p.x + p.y * q.z - p.z * q.y, p.w * q.y + q.w * p.y + p.z * q.x - p.x * q.z,
      p.w * q.z + q.w * p.z + p.x * q.y - p.y * q.x, p.w * q.w - p.x * q.x - p.y * q.y - p.z * q.z);
}

VQuaternion &VQuaternion::operator*=(const VQuaternion &other) { return *this = *this * other; }
VQuaternion VQuaternion::operator-() const { return VQuaternion(-x, -y, -z, -w); }
VQuaternion VQuaternion::conjugate() const { return VQuaternion(-x, -y, -z, w); }

VQuaternion VQuaternion::inverse() const {
  double n = x * x + y * y + z * z + w * w;
  if (n == 0.0) return *this;
  return VQuaternion(-x / n, -y / n, -z / n, w / n);
}

double VQuaternion::length() const { return std::sqrt(x * x + y * y + z * z + w * w); }

VQuaternion VQuaternion::normal() const {
  VQuaternion q(*this);
  return q.normalizeIt();
}

VQuaternion &VQuaternion::normalizeIt() {
  double len = length();
  if (len > 0.0) {
    x /= len;
    y /= len;
    z /= len;
    w /= len;
  }
  return *this;
}

VQuaternion VQuaternion::slerp(const VQuaternion &p, const VQuaternion &q, double t) {
  VQuaternion a = p.normal(), b = q.normal();
  double cosAngle = a.x * b.x + a.y * b.y + a.z * b.z + a.w * b.w;
  if (cosAngle < 0.0) {
    b = -b;
    cosAngle = -cosAngle;
  }
  double wa = 1.0 - t, wb = t;
  if (cosAngle < 0.9999999) {
    double angle = std::acos(std::min(cosAngle, 1.0));
    double s = std::sin(angle);
    wa = std::sin((1.0 - t) * angle) / s;
    wb = std::sin(t * angle) / s;
  }
  VQuaternion r(wa * a.x + wb * b.x, wa * a.y + wb * b.y, wa * a.z + wb * b.z, wa * a.w + wb * b.w);
  return r.normalizeIt();
}

bool VQuaternion::isEquivalent(const VQuaternion &o, double tolerance) const {
  auto near = [tolerance](const VQuaternion &a, const VQuaternion &b) {
    return std::fabs(a.x - b.x) <= tolerance && std::fabs(a.y - b.y) <= tolerance &&
           std::fabs(a.z - b.z) <= tolerance && std::fabs(a.w - b.w) <= tolerance;
  };
  VQuaternion a = normal(), b = o.normal();
  return near(a, b) || near(a, -b);
}

bool VQuaternion::operator==(const VQuaternion &o) const {
  return x == o.x && y == o.y && z == o.z && w == o.w;
}
bool VQuaternion::operator!=(const VQuaternion &o) const { return !(*this == o); }

OPENVORLA_NAMESPACE_CLOSE
