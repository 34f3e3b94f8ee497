// Base class of plug-in nodes that change geometry.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VItGeometry.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VSelectionList.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class VDagModifier;

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
  // Makes the accessory nodes with cmd, which the host runs after it made
  // the filter; kSuccess (nothing to make) by default.
  virtual VStatus accessoryNodeSetup(VDagModifier &cmd);

  // Moves the points of the geometry multiIndex, in the space of mat. The
  // default compute calls it for every input geometry; kNotImplemented by
  // default.
  virtual VStatus deform(VDataBlock &block, VItGeometry &iter, const VMatrix &mat,
                         unsigned int multiIndex);
  // What the filter changes besides point positions (DeformationDetails
  // flags); what setDeformationDetails set, 0 by default.
  virtual unsigned int getDeformationDetails() const;
  // The attributes through which the geometry enters and leaves the filter:
  // inputGeom and outputGeom by default.
  virtual VObject &inputShapeAttribute() const;
  virtual VObject &outputShapeAttribute() const;
  // Called when the set of the deformed objects changes: list holds the
  // objects added (listAdded) or removed.
  virtual VStatus setModifiedCallback(VSelectionList &list, bool listAdded);

  VPxNode::Type type() const override;  // kGeometryFilter
  VStatus setDeformationDetails(unsigned int details);
  // The geometry of input multiIndex, and of output multiIndex, from the
  // block; the null object while the node has no such geometry.
  VObject getInputGeom(VDataBlock &block, unsigned int multiIndex);
  VObject getOutputGeom(VDataBlock &block, unsigned int multiIndex);
  // Whether editing the deformed set reuses the connections the filter has.
  void setUseExistingConnectionWhenSetEditing(bool state);
  static const char *className();

  static VObject input;
  static VObject inputGeom;
  static VObject groupId;
  static VObject componentTagExpression;
  static VObject outputGeom;
  static VObject envelope;
  static VObject originalGeometry;

private:
  mutable VObject fNoAccessory;
  unsigned int fDeformationDetails;
  bool fUseExistingConnection;
};

OPENVORLA_NAMESPACE_CLOSE
