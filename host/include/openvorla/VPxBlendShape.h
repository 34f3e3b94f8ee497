// Base class of plug-in blend shapes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxGeometryFilter.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxBlendShape : public VPxGeometryFilter {
public:
  VPxBlendShape();
  ~VPxBlendShape() override;

  VPxNode::Type type() const override;  // kBlendShape
  // Blends the targets into the geometry geomData of the group groupId;
  // kNotImplemented: the host blends them itself.
  virtual VStatus deformData(VDataBlock &block, VDataHandle geomData, unsigned int groupId,
                             const VMatrix &mat, unsigned int multiIndex);
  static const char *className();

  static VObject weight;
  static VObject inputTarget;
  static VObject inputTargetGroup;
  static VObject inputTargetItem;
  static VObject inputGeomTarget;
  static VObject inputPointsTarget;
  static VObject inputComponentsTarget;
  static VObject targetWeights;
};

OPENVORLA_NAMESPACE_CLOSE
