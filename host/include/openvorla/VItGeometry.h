// Iterator over the points of a geometry that a deformer moves. The iterator
// keeps its own copy of the points; a new iterator has none and is done.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPointArray.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VItGeometry {
public:
  VItGeometry();
  explicit VItGeometry(const VPointArray &points);
  VItGeometry(const VItGeometry &other);
  ~VItGeometry();
  VItGeometry &operator=(const VItGeometry &other);

  bool isDone() const;
  VStatus next();
  VStatus reset();
  // The current point's index, and the number of points.
  int index() const;
  int count() const;
  // The current point; kFailure once the iterator is done.
  VPoint position(VStatus *ReturnStatus = NULL) const;
  VStatus setPosition(const VPoint &point);
  VStatus allPositions(VPointArray &points) const;
  // kInvalidParameter unless points has as many points as the geometry.
  VStatus setAllPositions(const VPointArray &points);

private:
  VPointArray fPoints;
  unsigned int fIndex;
};

OPENVORLA_NAMESPACE_CLOSE
