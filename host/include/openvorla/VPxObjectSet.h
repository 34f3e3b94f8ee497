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

  VPxNode::Type type() const override;  // kObjectSet
  // Whether the host may delete the set when its last member goes (as the
  // source of a connection with isSrcNode); true by default.
  virtual bool canBeDeleted(bool isSrcNode);
  static const char *className();

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
