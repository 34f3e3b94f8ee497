// VEulerRotation: rotations as three ordered angles.
#include <openvorla/VEulerRotation.h>

#include <openvorla/VMatrix.h>
#include <openvorla/VQuaternion.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

namespace {

// The axes of each order, the first applied first.
const int kAxes[6][3] = {{0, 1, 2}, {1, 2, 0}, {2, 0, 1}, {0, 2, 1}, {1, 0, 2}, {2, 1, 0}};

// An order that names none of the six is taken as kXYZ.
const int *axesOf(int order) { return kAxes[order >= 0 && order < 6 ? order : 0]; }

const VVector &axisVector(int axis) {
  static const VVector kUnit[3] = {VVector(1, 0, 0), VVector(0, 1, 0), VVector(0, 0, 1)};
  return kUnit[axis];
}

}  // namespace

VEulerRotation::VEulerRotation() : x(0.0), y(0.0), z(0.0), order(kXYZ) {}
VEulerRotation::VEulerRotation(double xx, double yy, double zz, RotationOrder ord)
    : x(xx), y(yy), z(zz), order(ord) {}
VEulerRotation::VEulerRotation(const VVector &v, RotationOrder ord)
    : x(v.x), y(v.y), z(v.z), order(ord) {}
VEulerRotation::VEulerRotation(const VEulerRotation &other) = default;
VEulerRotation::~VEulerRotation() = default;
VEulerRotation &VEulerRotation::operator=(const VEulerRotation &other) = default;

VEulerRotation &VEulerRotation::setValue(double xx, double yy, double zz, RotationOrder ord) {
  x = xx;
  y = yy;
  z = zz;
  order = ord;
  return *this;
}

VQuaternion VEulerRotation::asQuaternion() const {
  const double angles[3] = {x, y, z};
  const int *axes = axesOf(order);
  VQuaternion q;
  for (int n = 0; n < 3; ++n) q *= VQuaternion(angles[axes[n]], axisVector(axes[n]));
  return q;
}

VMatrix VEulerRotation::asMatrix() const { return asQuaternion().asMatrix(); }
VVector VEulerRotation::asVector() const { return VVector(x, y, z); }

VEulerRotation VEulerRotation::reorder(RotationOrder newOrder) const {
  return decompose(asMatrix(), newOrder);
}

// With the axes i, j, k of the order (i applied first) and s = +1 for the
// cyclic orders, -1 for the others, the matrix is Ri(a) * Rj(b) * Rk(c), whose
// entries give sin b = -s m[i][k], tan a = s m[j][k] / m[k][k] and
// tan c = s m[i][j] / m[i][i]. When cos b vanishes only a + c (or a - c) is
// defined; c is then taken as 0.
VEulerRotation VEulerRotation::decompose(const VMatrix &m, RotationOrder ord) {
  const int *axes = axesOf(ord);
  const int i = axes[0], j = axes[1], k = axes[2];
  const double s = (j == (i + 1) % 3) ? 1.0 : -1.0;
  const double cosB = std::hypot(m(i, i), m(i, j));
  double angles[3];
  angles[j] = std::atan2(-s * m(i, k), cosB);
  if (cosB > 1.0e-12) {
    angles[i] = std::atan2(s * m(j, k), m(k, k));
    angles[k] = std::atan2(s * m(i, j), m(i, i));
  } else {
    angles[i] = std::atan2(-s * m(k, j), m(j, j));
    angles[k] = 0.0;
  }
  return VEulerRotation(angles[0], angles[1], angles[2], ord);
}

bool VEulerRotation::isEquivalent(const VEulerRotation &o, double tolerance) const {
  return order == o.order && asVector().isEquivalent(o.asVector(), tolerance);
}

bool VEulerRotation::operator==(const VEulerRotation &o) const {
  return order == o.order && x == o.x && y == o.y && z == o.z;
}
bool VEulerRotation::operator!=(const VEulerRotation &o) const { return !(*this == o); }

OPENVORLA_NAMESPACE_CLOSE
