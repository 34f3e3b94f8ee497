// Three-component double vector. Vectors are row vectors: v * m transforms v by m.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class VMatrix;
class VQuaternion;

class OPENVORLA_EXPORT VVector {
public:
  VVector();
  VVector(double xx, double yy, double zz = 0.0);
  VVector(const VVector &other);
  ~VVector();
  VVector &operator=(const VVector &other);

  // index 0, 1 or 2.
  double operator[](unsigned int index) const;
  double &operator[](unsigned int index);

  VVector operator+(const VVector &other) const;
  VVector operator-(const VVector &other) const;
  VVector operator-() const;
  VVector operator*(double scale) const;
  VVector operator/(double scale) const;
  VVector &operator+=(const VVector &other);
  VVector &operator-=(const VVector &other);
  VVector &operator*=(double scale);
  double operator*(const VVector &other) const;   // dot product
  VVector operator^(const VVector &other) const;  // cross product
  // The direction transformed by the matrix: its translation row is ignored.
  VVector operator*(const VMatrix &matrix) const;
  VVector rotateBy(const VQuaternion &rotation) const;

  double length() const;
  // The unit vector of the same direction; the zero vector stays zero.
  VVector normal() const;
  // kInvalidParameter for the zero vector, which is left as it is.
  VStatus normalize();

  bool isEquivalent(const VVector &other, double tolerance = 1.0e-10) const;
  bool operator==(const VVector &other) const;
  bool operator!=(const VVector &other) const;

  double x;
  double y;
  double z;
};

OPENVORLA_NAMESPACE_CLOSE
