// Rotation quaternion (x, y, z, w), w the scalar part. Products compose like
// matrices do: (a * b).asMatrix() == a.asMatrix() * b.asMatrix(), a applied first.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class VEulerRotation;
class VMatrix;

class OPENVORLA_EXPORT VQuaternion {
public:
  VQuaternion();  // no rotation
  VQuaternion(double xx, double yy, double zz, double ww);
  // angle radians about axis, counter-clockwise looking down the axis.
  VQuaternion(double angle, const VVector &axis);
  // The rotation of the upper-left 3x3 part, which must be orthonormal.
  explicit VQuaternion(const VMatrix &rotationMatrix);
  VQuaternion(const VQuaternion &other);
  ~VQuaternion();
  VQuaternion &operator=(const VQuaternion &other);

  VQuaternion &setAxisAngle(const VVector &axis, double angle);
  // False for no rotation, when the axis is undefined (axis then (0, 0, 1)).
  bool getAxisAngle(VVector &axis, double &angle) const;

  VMatrix asMatrix() const;
  VEulerRotation asEulerRotation() const;  // in the order kXYZ

  VQuaternion operator*(const VQuaternion &other) const;
  VQuaternion &operator*=(const VQuaternion &other);
  VQuaternion operator-() const;
  VQuaternion conjugate() const;
  VQuaternion inverse() const;
  VQuaternion normal() const;
  VQuaternion &normalizeIt();
  double length() const;

  // Spherical interpolation from p (t = 0) to q (t = 1), the short way round.
  static VQuaternion slerp(const VQuaternion &p, const VQuaternion &q, double t);

  // q and -q are the same rotation and are equivalent.
  bool isEquivalent(const VQuaternion &other, double tolerance = 1.0e-10) const;
  bool operator==(const VQuaternion &other) const;
  bool operator!=(const VQuaternion &other) const;

  double x;
  double y;
  double z;
  double w;
};

OPENVORLA_NAMESPACE_CLOSE
