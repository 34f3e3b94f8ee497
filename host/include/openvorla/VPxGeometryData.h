// Base class of plug-in data types that hold geometry.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxGeometryIterator.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VTypeId.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxGeometryData : public VPxData {
public:
  VPxGeometryData();
  ~VPxGeometryData() override;

  // A new iterator over the listed components (over all of them without
  // useComponents), owned by the caller; null by default: no iteration.
  virtual VPxGeometryIterator *iterator(VObjectArray &componentList, VObject &component,
                                        bool useComponents);
  virtual VPxGeometryIterator *iterator(VObjectArray &componentList, VObject &component,
                                        bool useComponents, bool world) const;
  // Whether the component was made the group of every vertex; false by default.
  virtual bool updateCompleteVertexGroup(VObject &component) const;
  // Deletions of components; false: nothing was deleted.
  virtual bool deleteComponent(const VObjectArray &compList);
  virtual bool deleteComponentsFromGroups(const VObjectArray &compList, VIntArray &groupIdArray,
                                          VObjectArray &groupComponentArray, VObject &geomData);
  // Copies what has changed; the host's default calls copy() for a source.
  virtual void smartCopy(const VPxGeometryData *srcGeom);

  void copy(const VPxData &src) override = 0;
  VTypeId typeId() const override = 0;
  VString name() const override = 0;

  // The matrix that places the geometry in world space.
  VStatus setMatrix(const VMatrix &matrix);
  // False, and the identity, until a matrix is set.
  bool matrix(VMatrix &matrix) const;

private:
  VMatrix fMatrix;
  bool fHasMatrix;
};

OPENVORLA_NAMESPACE_CLOSE
