// VPxNode: the host's default node behaviour, node identity and the
// declarations of a node type's initializer.
#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxNode.h>

#include <standin/Lifetime.h>
#include <standin/Nodes.h>
#include <standin/Objects.h>

#include <algorithm>
#include <mutex>
#include <string>
#include <utility>
#include <vector>

#include "ObjectRecords.h"

OPENVORLA_NAMESPACE_OPEN

namespace {

// The declarations of the node type whose initializer runs. The host
// initializes one type at a time, between beginNodeType() and endNodeType().
struct NodeTypeDeclarations {
  std::mutex mutex;
  bool open = false;
  std::vector<VObject> attributes;
  std::vector<VObject> given;  // by the type's kind
  std::vector<std::pair<VObject, VObject>> affects;
  bool inherits = false;
  std::string parent;

  bool has(const VObject &attr) {
    return std::find(attributes.begin(), attributes.end(), attr) != attributes.end() ||
           std::find(given.begin(), given.end(), attr) != given.end();
  }

  // The attribute added before under one of the new one's names, if any.
  const VObject *nameClash(const AttributeInfo &added, const std::string &name) {
    for (const VObject &a : attributes) {
      AttributeInfo info;
      VObjectFactory::attributeInfo(a, &info);
      std::string other = VObjectFactory::name(a);
      if (other == name || other == added.briefName || info.briefName == name ||
          info.briefName == added.briefName)
        return &a;
    }
    return nullptr;
  }
};

NodeTypeDeclarations &declarations() {
  static NodeTypeDeclarations d;
  return d;
}

bool isAttribute(const VObject &object) { return object.apiType() == VFn::kAttribute; }

VStatus notAnAttribute() {
  return VStatus(VStatus::kInvalidParameter, "The object is not an attribute");
}

VStatus notDeclaring() {
  return VStatus(VStatus::kFailure,
                 "No node type is being initialized: attributes are declared in the "
                 "initializer of a node type");
}

VString quotedName(const VObject &attr) {
  return VString("'") + VObjectFactory::name(attr) + "'";
}

}  // namespace

// The host's access to a node's identity.
class VPxNodeIdentity {
 public:
  static void set(VPxNode &node, const VObject &object, const char *typeName, const VTypeId &id) {
    node.fThisObject = object;
    node.fTypeName = typeName ? typeName : "";
    node.fTypeId = id;
  }
};

VPxNode::VPxNode()
    : fExistWithoutInConnections(true),
      fExistWithoutOutConnections(true),
      fDoNotWrite(false),
      fMPSafe(false) {
  standin::noteConstructed("VPxNode");
}

VPxNode::~VPxNode() { standin::noteDestroyed("VPxNode"); }

void VPxNode::postConstructor() {}
VStatus VPxNode::compute(const VPlug &, VDataBlock &) { return VStatus::kUnknownParameter; }
bool VPxNode::getInternalValue(const VPlug &, VDataHandle &) { return false; }
bool VPxNode::setInternalValue(const VPlug &, const VDataHandle &) { return false; }

bool VPxNode::getInternalValueInContext(const VPlug &plug, VDataHandle &dataHandle, VDGContext &) {
  return getInternalValue(plug, dataHandle);
}

bool VPxNode::setInternalValueInContext(const VPlug &plug, const VDataHandle &dataHandle,
                                        VDGContext &) {
  return setInternalValue(plug, dataHandle);
}

int VPxNode::internalArrayCount(const VPlug &) const { return -1; }
int VPxNode::internalArrayCount(const VPlug &, const VDGContext &) const { return -1; }
void VPxNode::copyInternalData(VPxNode *) {}
bool VPxNode::legalConnection(const VPlug &, const VPlug &, bool, bool &) const { return false; }
bool VPxNode::legalDisconnection(const VPlug &, const VPlug &, bool, bool &) const { return false; }

VStatus VPxNode::connectionMade(const VPlug &, const VPlug &, bool) {
  return VStatus::kUnknownParameter;
}

VStatus VPxNode::connectionBroken(const VPlug &, const VPlug &, bool) {
  return VStatus::kUnknownParameter;
}

VStatus VPxNode::dependsOn(const VPlug &, const VPlug &, bool &) const {
  return VStatus::kUnknownParameter;
}

bool VPxNode::isPassiveOutput(const VPlug &) const { return false; }
VStatus VPxNode::shouldSave(const VPlug &, bool &) { return VStatus::kUnknownParameter; }
VPlug VPxNode::passThroughToOne(const VPlug &) const { return VPlug(); }
bool VPxNode::passThroughToMany(const VPlug &, VPlugArray &) const { return false; }
VStatus VPxNode::setDependentsDirty(const VPlug &, VPlugArray &) { return VStatus::kSuccess; }
bool VPxNode::isAbstractClass() const { return false; }
VStringArray VPxNode::getFilesToArchive(bool, bool, bool) const { return VStringArray(); }
bool VPxNode::isTrackingTopology() const { return false; }
VPxNode::SchedulingType VPxNode::schedulingType() const { return kDefaultScheduling; }
VStatus VPxNode::preEvaluation(const VDGContext &, const VEvaluationNode &) {
  return VStatus::kSuccess;
}

VStatus VPxNode::postEvaluation(const VDGContext &, const VEvaluationNode &, PostEvaluationType) {
  return VStatus::kSuccess;
}

void VPxNode::getCacheSetup(const VEvaluationNode &, VNodeCacheDisablingInfo &,
                            VNodeCacheSetupInfo &, VObjectArray &) const {}
void VPxNode::configCache(const VEvaluationNode &, VCacheSchema &) const {}

VTimeRange VPxNode::transformInvalidationRange(const VPlug &, const VTimeRange &input) const {
  return input;
}

void VPxNode::getExternalContent(VExternalContentInfoTable &) const {}
void VPxNode::setExternalContent(const VExternalContentLocationTable &) {}
VPxNode::Type VPxNode::type() const { return kDependNode; }

VTypeId VPxNode::typeId() const { return fTypeId; }
VString VPxNode::typeName() const { return fTypeName; }
VString VPxNode::name() const { return standin::objectName(fThisObject); }
VObject VPxNode::thisVObject() const { return fThisObject; }

VStatus VPxNode::setExistWithoutInConnections(bool flag) {
  fExistWithoutInConnections = flag;
  return VStatus::kSuccess;
}

bool VPxNode::existWithoutInConnections(VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return fExistWithoutInConnections;
}

VStatus VPxNode::setExistWithoutOutConnections(bool flag) {
  fExistWithoutOutConnections = flag;
  return VStatus::kSuccess;
}

bool VPxNode::existWithoutOutConnections(VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return fExistWithoutOutConnections;
}

VStatus VPxNode::setDoNotWrite(bool flag) {
  fDoNotWrite = flag;
  return VStatus::kSuccess;
}

bool VPxNode::doNotWrite(VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return fDoNotWrite;
}

void VPxNode::setMPSafe(bool flag) { fMPSafe = flag; }

VStatus VPxNode::addAttribute(const VObject &attr) {
  if (!isAttribute(attr)) return notAnAttribute();
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  if (!d.open) return notDeclaring();
  if (d.has(attr))
    return VStatus(VStatus::kInvalidParameter, "The attribute has already been added");
  AttributeInfo info;
  VObjectFactory::attributeInfo(attr, &info);
  if (const VObject *clash = d.nameClash(info, VObjectFactory::name(attr)))
    return VStatus(VStatus::kInvalidParameter, VString("The attribute ") + quotedName(attr) +
                                                   " has a name of the attribute " +
                                                   quotedName(*clash) + " added before");
  d.attributes.push_back(attr);
  return VStatus::kSuccess;
}

VStatus VPxNode::removeAttribute(const VObject &attr) {
  if (!isAttribute(attr)) return notAnAttribute();
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  if (!d.open) return notDeclaring();
  auto it = std::find(d.attributes.begin(), d.attributes.end(), attr);
  if (it == d.attributes.end())
    return VStatus(VStatus::kInvalidParameter, "The attribute has not been added");
  d.attributes.erase(it);
  auto involves = [&attr](const std::pair<VObject, VObject> &a) {
    return a.first == attr || a.second == attr;
  };
  d.affects.erase(std::remove_if(d.affects.begin(), d.affects.end(), involves), d.affects.end());
  return VStatus::kSuccess;
}

// A type that inherits its parent's attributes may name those too, which it
// has not added itself.
VStatus VPxNode::attributeAffects(const VObject &whenChanges, const VObject &isAffected) {
  if (!isAttribute(whenChanges) || !isAttribute(isAffected)) return notAnAttribute();
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  if (!d.open) return notDeclaring();
  for (const VObject *attr : {&whenChanges, &isAffected})
    if (!d.inherits && !d.has(*attr))
      return VStatus(VStatus::kInvalidParameter, VString("The attribute ") + quotedName(*attr) +
                                                     " has not been added to the node type");
  auto pair = std::make_pair(whenChanges, isAffected);
  if (std::find(d.affects.begin(), d.affects.end(), pair) == d.affects.end())
    d.affects.push_back(pair);
  return VStatus::kSuccess;
}

VStatus VPxNode::attributeAffects(const VPlug &whenChanges, const VPlug &isAffected) {
  return attributeAffects(whenChanges.attribute(), isAffected.attribute());
}

VStatus VPxNode::inheritAttributesFrom(const VString &parentClassName) {
  if (!VFnPlugin::isNodeRegistered(parentClassName))
    return VStatus(VStatus::kInvalidParameter, "No plug-in node type of that name is registered");
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  if (!d.open) return notDeclaring();
  if (d.inherits || !d.attributes.empty())
    return VStatus(VStatus::kFailure,
                   "Attributes are inherited once, before any attribute is added");
  d.inherits = true;
  d.parent = parentClassName.asUTF8();
  return VStatus::kSuccess;
}

const char *VPxNode::className() { return "VPxNode"; }

// The stand-in keeps no attribute values yet, so no attribute holds a file name.
bool VPxNode::getExternalContentForFileAttr(const VObject &, VExternalContentInfoTable &) const {
  return false;
}

bool VPxNode::setExternalContentForFileAttr(const VObject &,
                                            const VExternalContentLocationTable &) {
  return false;
}

bool VPxNode::addExternalContentForFileAttr(VExternalContentInfoTable &, const VObject &) const {
  return false;
}

bool VPxNode::addExternalContentForFileAttr(VExternalContentInfoTable &, const VString &) const {
  return false;
}

VObject VPxNode::message = standin::makeAttribute("VPxNode.message");
VObject VPxNode::isHistoricallyInteresting =
    standin::makeAttribute("VPxNode.isHistoricallyInteresting");
VObject VPxNode::caching = standin::makeAttribute("VPxNode.caching");
VObject VPxNode::state = standin::makeAttribute("VPxNode.state");
VObject VPxNode::frozen = standin::makeAttribute("VPxNode.frozen");

OPENVORLA_NAMESPACE_CLOSE

namespace standin {

using namespace OPENVORLA_NAMESPACE;

void setNodeIdentity(VPxNode &node, const VObject &object, const char *typeName,
                     const VTypeId &typeId) {
  VPxNodeIdentity::set(node, object, typeName, typeId);
}

void beginNodeType(const std::vector<VObject> &given) {
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  d.open = true;
  d.given = given;
  d.attributes.clear();
  d.affects.clear();
  d.inherits = false;
  d.parent.clear();
}

void endNodeType() {
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  d.open = false;
}

NodeTypeDeclaration nodeTypeDeclaration() {
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  return NodeTypeDeclaration{d.attributes, d.affects, d.parent};
}

unsigned int nodeTypeAttributeCount() {
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  return static_cast<unsigned int>(d.attributes.size());
}

bool nodeTypeHasAttribute(const VObject &attribute) {
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  return d.has(attribute);
}

bool nodeTypeAffects(const VObject &whenChanges, const VObject &isAffected) {
  NodeTypeDeclarations &d = declarations();
  std::lock_guard<std::mutex> guard(d.mutex);
  auto pair = std::make_pair(whenChanges, isAffected);
  return std::find(d.affects.begin(), d.affects.end(), pair) != d.affects.end();
}

}  // namespace standin
