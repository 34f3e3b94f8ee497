// Base class of plug-in object sets.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxObjectSet : public VPxNode {
public:
  VPxObjectSet();
  ~VPxObjectSet() override;

  static VObject dagSetMembers;
  static VObject DNSetMembers;
  static VObject memberWireframeColor;
  static VObject annotation;
  static VObject isLayer;
  static VObject verticesOnlySet;
  static VObject edgesOnlySet;
  static VObject facetsOnlySet;
  static VObject editPointsOnlySet;
  static VObject renderableOnlySet;
  static VObject partition;
  static VObject groupNodes;
  static VObject usedByNodes;
};

OPENVORLA_NAMESPACE_CLOSE
