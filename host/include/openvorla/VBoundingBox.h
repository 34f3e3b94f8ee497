// Axis-aligned box. A new box is empty: it contains no point until one is
// added, and its corners read as the origin.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VPoint.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VBoundingBox {
public:
  VBoundingBox();
  // The box spanned by two opposite corners, in any order.
  VBoundingBox(const VPoint &corner1, const VPoint &corner2);
  VBoundingBox(const VBoundingBox &other);
  ~VBoundingBox();
  VBoundingBox &operator=(const VBoundingBox &other);

  void clear();
  bool isEmpty() const;
  // Grows the box to hold the point or the other box (an empty one adds nothing).
  void expand(const VPoint &point);
  void expand(const VBoundingBox &box);
  // The box around the eight transformed corners.
  void transformUsing(const VMatrix &matrix);

  // Boundaries belong to the box; an empty box contains and meets nothing.
  bool contains(const VPoint &point) const;
  bool intersects(const VBoundingBox &box, double tolerance = 0.0) const;

  VPoint min() const;
  VPoint max() const;
  VPoint center() const;
  double width() const;
  double height() const;
  double depth() const;

  bool operator==(const VBoundingBox &other) const;
  bool operator!=(const VBoundingBox &other) const;

private:
  VPoint fMin;
  VPoint fMax;
  bool fEmpty;
};

OPENVORLA_NAMESPACE_CLOSE
