// Rotation as three angles in radians about x, y and z, applied in the given
// order: kXYZ rotates about x first, then y, then z.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VVector.h>

OPENVORLA_NAMESPACE_OPEN

class VMatrix;
class VQuaternion;

class OPENVORLA_EXPORT VEulerRotation {
public:
  enum RotationOrder {
    kXYZ,
    kYZX,
    kZXY,
    kXZY,
    kYXZ,
    kZYX
  };

  VEulerRotation();
  VEulerRotation(double xx, double yy, double zz, RotationOrder ord = kXYZ);
  VEulerRotation(const VVector &angles, RotationOrder ord = kXYZ);
  VEulerRotation(const VEulerRotation &other);
  ~VEulerRotation();
  VEulerRotation &operator=(const VEulerRotation &other);

  VEulerRotation &setValue(double xx, double yy, double zz, RotationOrder ord = kXYZ);
  VQuaternion asQuaternion() const;
  VMatrix asMatrix() const;
  VVector asVector() const;
  // The same rotation given in another order.
  VEulerRotation reorder(RotationOrder newOrder) const;
  // The angles in the given order of the rotation part of a matrix whose
  // upper-left 3x3 part is orthonormal. The middle angle lies in [-pi/2, pi/2].
  static VEulerRotation decompose(const VMatrix &matrix, RotationOrder ord);

  // Same order and angles within tolerance; the same rotation given by other
  // angles is not equivalent (compare asQuaternion() for that).
  bool isEquivalent(const VEulerRotation &other, double tolerance = 1.0e-10) const;
  bool operator==(const VEulerRotation &other) const;
  bool operator!=(const VEulerRotation &other) const;

  double x;
  double y;
  double z;
  RotationOrder order;
};

OPENVORLA_NAMESPACE_CLOSE
