// Base class of the dependency-graph nodes that plug-ins define.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VCacheSchema.h>
#include <openvorla/VDGContext.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>
#include <openvorla/VEvaluationNode.h>
#include <openvorla/VExternalContentInfoTable.h>
#include <openvorla/VExternalContentLocationTable.h>
#include <openvorla/VNodeCacheDisablingInfo.h>
#include <openvorla/VNodeCacheSetupInfo.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPlugArray.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>
#include <openvorla/VTimeRange.h>
#include <openvorla/VTypeId.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxNode {
public:
  enum Type {
    kDependNode,
    kLocatorNode,
    kDeformerNode,
    kManipContainer,
    kSurfaceShape,
    kFieldNode,
    kEmitterNode,
    kSpringNode,
    kIkSolverNode,
    kHardwareShader,
    kHwShaderNode,
    kTransformNode,
    kObjectSet,
    kFluidEmitterNode,
    kImagePlaneNode,
    kParticleAttributeMapperNode,
    kCameraSetNode,
    kConstraintNode,
    kManipulatorNode,
    kMotionPathNode,
    kClientDeviceNode,
    kThreadedDeviceNode,
    kAssembly,
    kSkinCluster,
    kGeometryFilter,
    kBlendShape,
    kLast
  };

  enum PostEvaluationType {
    kEvaluatedIndirectly,
    kEvaluatedDirectly,
    kLeaveDirty,
    kPostEvaluationTypeLast
  };

  enum SchedulingType {
    kParallel = 1,
    kSerial,
    kGloballySerial,
    kUntrusted,
    kSchedulingTypeLast,
    kDefaultScheduling = kSerial,
    kSerialize = kSerial,
    kGloballySerialize = kGloballySerial
  };

  VPxNode();
  virtual ~VPxNode();

  // Called once the host has made the node and given it its object.
  virtual void postConstructor();

  // Computes the plug's value into the data block. kUnknownParameter means
  // that the node does not compute this plug and the host should.
  virtual VStatus compute(const VPlug &plug, VDataBlock &dataBlock);

  // Values the node keeps itself instead of in its data block. False: the host
  // reads or writes the data block. The context forms call the plain ones.
  virtual bool getInternalValue(const VPlug &plug, VDataHandle &dataHandle);
  virtual bool setInternalValue(const VPlug &plug, const VDataHandle &dataHandle);
  virtual bool getInternalValueInContext(const VPlug &plug, VDataHandle &dataHandle,
                                         VDGContext &ctx);
  virtual bool setInternalValueInContext(const VPlug &plug, const VDataHandle &dataHandle,
                                         VDGContext &ctx);
  // The element count of an internal array attribute; -1: the host counts.
  virtual int internalArrayCount(const VPlug &plug) const;
  virtual int internalArrayCount(const VPlug &plug, const VDGContext &ctx) const;
  // Copies internal values when the node is duplicated.
  virtual void copyInternalData(VPxNode *node);

  // The connection queries answer false (not decided here: the host applies
  // its own rules) or true with the answer in isLegal.
  virtual bool legalConnection(const VPlug &plug, const VPlug &otherPlug, bool asSrc,
                               bool &isLegal) const;
  virtual bool legalDisconnection(const VPlug &plug, const VPlug &otherPlug, bool asSrc,
                                  bool &isLegal) const;
  virtual VStatus connectionMade(const VPlug &plug, const VPlug &otherPlug, bool asSrc);
  virtual VStatus connectionBroken(const VPlug &plug, const VPlug &otherPlug, bool asSrc);
  // kUnknownParameter: the attribute dependencies decide.
  virtual VStatus dependsOn(const VPlug &plug, const VPlug &otherPlug, bool &depends) const;
  virtual bool isPassiveOutput(const VPlug &plug) const;
  // kUnknownParameter: the host saves the plug when its value is not the default.
  virtual VStatus shouldSave(const VPlug &plug, bool &isSaving);
  virtual VPlug passThroughToOne(const VPlug &plug) const;
  virtual bool passThroughToMany(const VPlug &plug, VPlugArray &plugArray) const;
  // Adds to plugArray the plugs that the change of plug dirties beyond the
  // attribute dependencies.
  virtual VStatus setDependentsDirty(const VPlug &plug, VPlugArray &plugArray);

  virtual bool isAbstractClass() const;
  virtual VStringArray getFilesToArchive(bool shortName = false, bool unresolvedName = false,
                                         bool markCouldBeImageSequence = false) const;
  virtual bool isTrackingTopology() const;
  virtual SchedulingType schedulingType() const;
  virtual VStatus preEvaluation(const VDGContext &context, const VEvaluationNode &evaluationNode);
  virtual VStatus postEvaluation(const VDGContext &context, const VEvaluationNode &evaluationNode,
                                 PostEvaluationType evalType);
  virtual void getCacheSetup(const VEvaluationNode &evalNode,
                             VNodeCacheDisablingInfo &disablingInfo,
                             VNodeCacheSetupInfo &cacheSetupInfo,
                             VObjectArray &monitoredAttributes) const;
  virtual void configCache(const VEvaluationNode &evalNode, VCacheSchema &schema) const;
  // The times whose values change when the source's values in input change.
  virtual VTimeRange transformInvalidationRange(const VPlug &source, const VTimeRange &input) const;
  virtual void getExternalContent(VExternalContentInfoTable &table) const;
  virtual void setExternalContent(const VExternalContentLocationTable &table);
  virtual VPxNode::Type type() const;

  // The registered type and the host object of this node; unset (0, "" and
  // the null object) until the host has made the node.
  VTypeId typeId() const;
  VString typeName() const;
  VString name() const;
  VObject thisVObject() const;

  // Both are true by default: the node stays when its last connection goes.
  VStatus setExistWithoutInConnections(bool flag);
  bool existWithoutInConnections(VStatus *ReturnStatus = NULL) const;
  VStatus setExistWithoutOutConnections(bool flag);
  bool existWithoutOutConnections(VStatus *ReturnStatus = NULL) const;
  // Whether the node is left out when the scene is saved; false by default.
  VStatus setDoNotWrite(bool flag);
  bool doNotWrite(VStatus *ReturnStatus = NULL) const;
  // Whether compute may run on several threads at once.
  void setMPSafe(bool flag);

  // For the initializer of a node type: the attributes of the type being
  // registered and the dependencies between them. kFailure outside an
  // initializer. kInvalidParameter for a null object or one that is not an
  // attribute, for adding an attribute twice or one whose long or brief name
  // another attribute of the type has, for removing one that was not added,
  // and for naming an attribute the type has not added in attributeAffects
  // (unless the type inherits attributes).
  static VStatus addAttribute(const VObject &attr);
  static VStatus removeAttribute(const VObject &attr);
  static VStatus attributeAffects(const VObject &whenChanges, const VObject &isAffected);
  static VStatus attributeAffects(const VPlug &whenChanges, const VPlug &isAffected);
  // Gives the type being registered the attributes of a registered plug-in
  // node type, before its own; kInvalidParameter for a name that is not
  // registered.
  static VStatus inheritAttributesFrom(const VString &parentClassName);
  static const char *className();

  static VObject message;
  static VObject isHistoricallyInteresting;
  static VObject caching;
  static VObject state;
  static VObject frozen;

protected:
  // The default getExternalContent and setExternalContent for a file-name
  // attribute: false when the attribute holds no file name.
  bool getExternalContentForFileAttr(const VObject &attr, VExternalContentInfoTable &table) const;
  bool setExternalContentForFileAttr(const VObject &attr,
                                     const VExternalContentLocationTable &table);
  bool addExternalContentForFileAttr(VExternalContentInfoTable &table, const VObject &attr) const;
  // The same for the attribute of that long name.
  bool addExternalContentForFileAttr(VExternalContentInfoTable &table,
                                     const VString &attrName) const;

private:
  friend class VPxNodeIdentity;
  VObject fThisObject;
  VString fTypeName;
  VTypeId fTypeId;
  bool fExistWithoutInConnections;
  bool fExistWithoutOutConnections;
  bool fDoNotWrite;
  bool fMPSafe;
};

OPENVORLA_NAMESPACE_CLOSE
