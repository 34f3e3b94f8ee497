// VMatrix: 4x4 matrices for row vectors.
#include <openvorla/VMatrix.h>

#include <cmath>
#include <cstring>
#include <utility>

OPENVORLA_NAMESPACE_OPEN

VMatrix::VMatrix() { setToIdentity(); }
VMatrix::VMatrix(const double values[4][4]) { std::memcpy(fValue, values, sizeof(fValue)); }
VMatrix::VMatrix(const VMatrix &other) = default;
VMatrix::~VMatrix() = default;
VMatrix &VMatrix::operator=(const VMatrix &other) = default;

double VMatrix::operator()(unsigned int row, unsigned int col) const { return fValue[row][col]; }
double &VMatrix::operator()(unsigned int row, unsigned int col) { return fValue[row][col]; }

VStatus VMatrix::get(double dest[4][4]) const {
  std::memcpy(dest, fValue, sizeof(fValue));
  return VStatus::kSuccess;
}

VMatrix &VMatrix::setToIdentity() {
  for (int r = 0; r < 4; ++r)
    for (int c = 0; c < 4; ++c) fValue[r][c] = r == c ? 1.0 : 0.0;
  return *this;
}

VMatrix VMatrix::operator*(const VMatrix &right) const {
  VMatrix product;
  for (int r = 0; r < 4; ++r)
    for (int c = 0; c < 4; ++c) {
      double sum = 0.0;
      for (int k = 0; k < 4; ++k) sum += fValue[r][k] * right.fValue[k][c];
      product.fValue[r][c] = sum;
    }
  return product;
}

VMatrix &VMatrix::operator*=(const VMatrix &right) { return *this = *this * right; }

VMatrix VMatrix::operator*(double scale) const {
  VMatrix m(*this);
  for (auto &row : m.fValue)
    for (double &v : row) v *= scale;
  return m;
}

VMatrix VMatrix::operator+(const VMatrix &other) const {
  VMatrix m(*this);
  for (int r = 0; r < 4; ++r)
    for (int c = 0; c < 4; ++c) m.fValue[r][c] += other.fValue[r][c];
  return m;
}

VMatrix VMatrix::operator-(const VMatrix &other) const { return *this + other * -1.0; }

VMatrix VMatrix::transpose() const {
  VMatrix m;
  for (int r = 0; r < 4; ++r)
    for (int c = 0; c < 4; ++c) m.fValue[r][c] = fValue[c][r];
  return m;
}

// Gauss-Jordan elimination with partial pivoting.
VMatrix VMatrix::inverse() const {
  double a[4][4];
  std::memcpy(a, fValue, sizeof(a));
  VMatrix inv;
  for (int col = 0; col < 4; ++col) {
    int pivot = col;
    for (int r = col + 1; r < 4; ++r)
      if (std::fabs(a[r][col]) > std::fabs(a[pivot][col])) pivot = r;
    if (std::fabs(a[pivot][col]) < 1.0e-300) return VMatrix();
    if (pivot != col) {
      std::swap(a[pivot], a[col]);
      std::swap(inv.fValue[pivot], inv.fValue[col]);
    }
    double scale = 1.0 / a[col][col];
    for (int c = 0; c < 4; ++c) {
      a[col][c] *= scale;
      inv.fValue[col][c] *= scale;
    }
    for (int r = 0; r < 4; ++r) {
      if (r == col || a[r][col] == 0.0) continue;
      double factor = a[r][col];
      for (int c = 0; c < 4; ++c) {
        a[r][c] -= factor * a[col][c];
        inv.fValue[r][c] -= factor * inv.fValue[col][c];
      }
    }
  }
  return inv;
}

namespace {

double det3(double a, double b, double c, double d, double e, double f, double g, double h,
            double i) {
  return a * (e * i - f * h) - b * (d * i - f * g) + c * (d * h - e * g);
}

}  // namespace

double VMatrix::det3x3() const {
  const auto &m = fValue;
  return det3(m[0][0], m[0][1], m[0][2], m[1][0], m[1][1], m[1][2], m[2][0], m[2][1], m[2][2]);
}

// Expansion along row 0.
double VMatrix::det4x4() const {
  double det = 0.0;
  for (int c = 0; c < 4; ++c) {
    double minor[9];
    int n = 0;
    for (int r = 1; r < 4; ++r)
      for (int k = 0; k < 4; ++k)
        if (k != c) minor[n++] = fValue[r][k];
    double sub = det3(minor[0], minor[1], minor[2], minor[3], minor[4], minor[5], minor[6],
                      minor[7], minor[8]);
    det += (c % 2 ? -1.0 : 1.0) * fValue[0][c] * sub;
  }
  return det;
}

bool VMatrix::isSingular(double tolerance) const { return std::fabs(det4x4()) <= tolerance; }

VVector VMatrix::translation() const { return VVector(fValue[3][0], fValue[3][1], fValue[3][2]); }

VMatrix &VMatrix::setTranslation(const VVector &t) {
  fValue[3][0] = t.x;
  fValue[3][1] = t.y;
  fValue[3][2] = t.z;
  return *this;
}

bool VMatrix::isEquivalent(const VMatrix &other, double tolerance) const {
  for (int r = 0; r < 4; ++r)
    for (int c = 0; c < 4; ++c)
      if (std::fabs(fValue[r][c] - other.fValue[r][c]) > tolerance) return false;
  return true;
}

bool VMatrix::operator==(const VMatrix &other) const { return isEquivalent(other, 0.0); }
bool VMatrix::operator!=(const VMatrix &other) const { return !(*this == other); }

OPENVORLA_NAMESPACE_CLOSE
