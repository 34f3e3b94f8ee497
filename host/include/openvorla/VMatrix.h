// 4x4 double matrix for row vectors: a point p is transformed as p * m, so the
// translation is in row 3, and a * b applies a first, then b.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VMatrix {
public:
  VMatrix();  // the identity
  explicit VMatrix(const double values[4][4]);
  VMatrix(const VMatrix &other);
  ~VMatrix();
  VMatrix &operator=(const VMatrix &other);

  // row and col below 4.
  double operator()(unsigned int row, unsigned int col) const;
  double &operator()(unsigned int row, unsigned int col);
  VStatus get(double dest[4][4]) const;

  VMatrix &setToIdentity();
  VMatrix operator*(const VMatrix &right) const;
  VMatrix &operator*=(const VMatrix &right);
  VMatrix operator*(double scale) const;
  VMatrix operator+(const VMatrix &other) const;
  VMatrix operator-(const VMatrix &other) const;

  VMatrix transpose() const;
  // The inverse; a singular matrix has none, and the identity is returned.
  VMatrix inverse() const;
  double det4x4() const;
  double det3x3() const;  // of the upper-left 3x3 part
  bool isSingular(double tolerance = 1.0e-12) const;

  // Row 3 as a vector, and the matrix with row 3 set from one.
  VVector translation() const;
  VMatrix &setTranslation(const VVector &translation);

  bool isEquivalent(const VMatrix &other, double tolerance = 1.0e-10) const;
  bool operator==(const VMatrix &other) const;
  bool operator!=(const VMatrix &other) const;

private:
  double fValue[4][4];
};

OPENVORLA_NAMESPACE_CLOSE
