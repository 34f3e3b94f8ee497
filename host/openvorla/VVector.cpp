// VVector: three-component vectors.
#include <openvorla/VVector.h>

#include <openvorla/VMatrix.h>
#include <openvorla/VQuaternion.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VVector::VVector() : x(0.0), y(0.0), z(0.0) {}
VVector::VVector(double xx, double yy, double zz) : x(xx), y(yy), z(zz) {}
VVector::VVector(const VVector &other) = default;
VVector::~VVector() = default;
VVector &VVector::operator=(const VVector &other) = default;

double VVector::operator[](unsigned int index) const { return index == 0 ? x : index == 1 ? y : z; }
double &VVector::operator[](unsigned int index) { return index == 0 ? x : index == 1 ? y : z; }

VVector VVector::operator+(const VVector &o) const { return VVector(x + o.x, y + o.y, z + o.z); }
VVector VVector::operator-(const VVector &o) const { return VVector(x - o.x, y - o.y, z - o.z); }
VVector VVector::operator-() const { return VVector(-x, -y, -z); }
VVector VVector::operator*(double s) const { return VVector(x * s, y * s, z * s); }
VVector VVector::operator/(double s) const { return VVector(x / s, y / s, z / s); }

VVector &VVector::operator+=(const VVector &o) {
  x += o.x;
  y += o.y;
  z += o.z;
  return *this;
}

VVector &VVector::operator-=(const VVector &o) {
  x -= o.x;
  y -= o.y;
  z -= o.z;
  return *this;
}

VVector &VVector::operator*=(double s) {
  x *= s;
  y *= s;
  z *= s;
  return *this;
}

double VVector::operator*(const VVector &o) const { return x * o.x + y * o.y + z * o.z; }

VVector VVector::operator^(const VVector &o) const {
  return VVector(y * o.z - z * o.y, z * o.x - x * o.z, x * o.y - y * o.x);
}

VVector VVector::operator*(const VMatrix &m) const {
  return VVector(x * m(0, 0) + y * m(1, 0) + z * m(2, 0), x * m(0, 1) + y * m(1, 1) + z * m(2, 1),
                 x * m(0, 2) + y * m(1, 2) + z * m(2, 2));
}

VVector VVector::rotateBy(const VQuaternion &rotation) const {
  return *this * rotation.normal().asMatrix();
}

double VVector::length() const { return std::sqrt(x * x + y * y + z * z); }

VVector VVector::normal() const {
  double len = length();
  return len > 0.0 ? *this / len : *this;
}

VStatus VVector::normalize() {
  double len = length();
  if (len == 0.0) return VStatus(VStatus::kInvalidParameter, "Cannot normalize a zero vector");
  *this = *this / len;
  return VStatus::kSuccess;
}

bool VVector::isEquivalent(const VVector &o, double tolerance) const {
  return std::fabs(x - o.x) <= tolerance && std::fabs(y - o.y) <= tolerance &&
         std::fabs(z - o.z) <= tolerance;
}

bool VVector::operator==(const VVector &o) const { return x == o.x && y == o.y && z == o.z; }
bool VVector::operator!=(const VVector &o) const { return !(*this == o); }

OPENVORLA_NAMESPACE_CLOSE
