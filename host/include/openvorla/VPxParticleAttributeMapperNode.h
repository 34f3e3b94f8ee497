// Base class of plug-in mappers of per-particle attributes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxParticleAttributeMapperNode : public VPxNode {
public:
  VPxParticleAttributeMapperNode();
  ~VPxParticleAttributeMapperNode() override;

  VPxNode::Type type() const override;  // kParticleAttributeMapperNode
  // Maps outValuePP linearly from the particles' uCoordPP into
  // [outMinValue, outMaxValue]; the other plugs are the host's.
  VStatus compute(const VPlug &plug, VDataBlock &dataBlock) override;
  static const char *className();

  static VObject computeNode;
  static VObject uCoordPP;
  static VObject vCoordPP;
  static VObject outMinValue;
  static VObject outMaxValue;
  static VObject computeNodeColor;
  static VObject computeNodeColorR;
  static VObject computeNodeColorG;
  static VObject computeNodeColorB;
  static VObject time;
  static VObject outColorPP;
  static VObject outValuePP;
};

OPENVORLA_NAMESPACE_CLOSE
