// Base class of plug-in iterators over the components of a geometry.
//
// The host's iterator walks the indices 0 to maxPoints() - 1 and reads and
// writes no points: a plug-in overrides point() and setPoint() to reach its
// geometry, which the iterator keeps as the opaque pointer it was given.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPoint.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class VPxSurfaceShape;

class OPENVORLA_EXPORT VPxGeometryIterator {
public:
  VPxGeometryIterator(void *userGeometry, VObjectArray &components);
  VPxGeometryIterator(void *userGeometry, VObject &components);
  virtual ~VPxGeometryIterator();

  virtual bool isDone() const;
  virtual VStatus next();
  virtual VStatus reset();
  // The component of the current point; the host's default leaves it as it is.
  virtual void component(VObject &component);
  // Whether point() and setPoint() reach the geometry; false by default.
  virtual bool hasPoints() const;
  virtual bool hasNormals() const;
  // The number of points iterated over: maxPoints() by default.
  virtual int iteratorCount() const;
  virtual VPoint point() const;  // the origin by default
  virtual void setPoint(const VPoint &point) const;
  // Sets the current point and moves on; the index of the point set.
  virtual int setPointGetNext(VPoint &point);
  virtual int index() const;
  // The index in the geometry before any simplification: index() by default.
  virtual int indexUnsimplified() const;

  int currentPoint() const;
  int maxPoints() const;  // 0 until set
  // The shape whose geometry is iterated over.
  VStatus setObject(VPxSurfaceShape &shape);
  static const char *className();

protected:
  // For derived iterators: the position and the number of points, each
  // kInvalidParameter when negative; the shape (null until set) and the
  // geometry the iterator was made with.
  VStatus setCurrentPoint(int index);
  VStatus setMaxPoints(int count);
  VPxSurfaceShape *object() const;
  void *geometry() const;

private:
  void *fGeometry;
  VPxSurfaceShape *fShape;
  int fCurrent;
  int fMax;
};

OPENVORLA_NAMESPACE_CLOSE
