// Base class of plug-in nodes that change geometry.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxGeometryFilter : public VPxNode {
public:
  enum DeformationDetails {
    kDeformsUVs = 2,
    kDeformsColors = 4,
    kDeformsAll = 6
  };

  enum GeometryChange {
    kNoChange,
    kTopologyChange,
    kWeightsChange
  };

  VPxGeometryFilter();
  ~VPxGeometryFilter() override;

  // The attribute of the node that an accessory node (a handle the filter
  // makes along with itself) connects to; the null object by default.
  virtual VObject &accessoryAttribute() const;

  static VObject input;
  static VObject inputGeom;
  static VObject groupId;
  static VObject componentTagExpression;
  static VObject outputGeom;
  static VObject envelope;
  static VObject originalGeometry;

private:
  mutable VObject fNoAccessory;
};

OPENVORLA_NAMESPACE_CLOSE
