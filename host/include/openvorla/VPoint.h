// Homogeneous point (x, y, z, w), w = 1 for a cartesian point. Points are row
// vectors: p * m transforms p by m, translation included.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class VMatrix;

class OPENVORLA_EXPORT VPoint {
public:
  VPoint();
  VPoint(double xx, double yy, double zz = 0.0, double ww = 1.0);
  explicit VPoint(const VVector &vector);
  VPoint(const VPoint &other);
  ~VPoint();
  VPoint &operator=(const VPoint &other);

  // index 0 to 3.
  double operator[](unsigned int index) const;
  double &operator[](unsigned int index);

  VPoint operator+(const VVector &offset) const;
  VPoint operator-(const VVector &offset) const;
  VVector operator-(const VPoint &other) const;
  VPoint &operator+=(const VVector &offset);
  VPoint &operator-=(const VVector &offset);
  VPoint operator*(const VMatrix &matrix) const;

  // Divides by w; kInvalidParameter when w is zero, and the point is unchanged.
  VStatus cartesianize();
  double distanceTo(const VPoint &other) const;
  VVector asVector() const;  // the cartesian coordinates

  bool isEquivalent(const VPoint &other, double tolerance = 1.0e-10) const;
  bool operator==(const VPoint &other) const;
  bool operator!=(const VPoint &other) const;

  double x;
  double y;
  double z;
  double w;
};

OPENVORLA_NAMESPACE_CLOSE
