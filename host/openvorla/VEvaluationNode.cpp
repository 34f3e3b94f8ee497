// VEvaluationNode and the cache descriptions a node gives the evaluation
// manager: VNodeCacheSetupInfo, VNodeCacheDisablingInfo and VCacheSchema.
#include <openvorla/VCacheSchema.h>
#include <openvorla/VEvaluationNode.h>
#include <openvorla/VNodeCacheDisablingInfo.h>
#include <openvorla/VNodeCacheSetupInfo.h>

#include <algorithm>

OPENVORLA_NAMESPACE_OPEN

VEvaluationNode::VEvaluationNode() = default;
VEvaluationNode::VEvaluationNode(const VObject &node, const VPlugArray &dirtyPlugs)
    : fNode(node), fDirtyPlugs(dirtyPlugs) {}
VEvaluationNode::VEvaluationNode(const VEvaluationNode &other) = default;
VEvaluationNode::~VEvaluationNode() = default;
VEvaluationNode &VEvaluationNode::operator=(const VEvaluationNode &other) = default;

VObject VEvaluationNode::dependencyNode(VStatus *ReturnStatus) const {
  if (ReturnStatus)
    *ReturnStatus = fNode.isNull() ? VStatus(VStatus::kInvalidParameter, "No node is evaluated")
                                   : VStatus(VStatus::kSuccess);
  return fNode;
}

bool VEvaluationNode::dirtyPlugExists(const VObject &attribute, VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  for (unsigned int i = 0; i < fDirtyPlugs.length(); ++i)
    if (fDirtyPlugs[i].attribute() == attribute) return true;
  return false;
}

unsigned int VEvaluationNode::dirtyPlugCount() const { return fDirtyPlugs.length(); }
VPlug VEvaluationNode::dirtyPlug(unsigned int index) const {
  return index < fDirtyPlugs.length() ? fDirtyPlugs[index] : VPlug();
}

VNodeCacheSetupInfo::VNodeCacheSetupInfo() {
  std::fill(std::begin(fPreferences), std::end(fPreferences), false);
  std::fill(std::begin(fRequirements), std::end(fRequirements), false);
}

VNodeCacheSetupInfo::VNodeCacheSetupInfo(const VNodeCacheSetupInfo &other) = default;
VNodeCacheSetupInfo::~VNodeCacheSetupInfo() = default;
VNodeCacheSetupInfo &VNodeCacheSetupInfo::operator=(const VNodeCacheSetupInfo &other) = default;

void VNodeCacheSetupInfo::setPreference(Preference preference, bool value) {
  if (preference >= 0 && preference < kPreferenceLast) fPreferences[preference] = value;
}

bool VNodeCacheSetupInfo::getPreference(Preference preference) const {
  return preference >= 0 && preference < kPreferenceLast && fPreferences[preference];
}

void VNodeCacheSetupInfo::setRequirement(Requirement requirement, bool value) {
  if (requirement >= 0 && requirement < kRequirementLast) fRequirements[requirement] = value;
}

bool VNodeCacheSetupInfo::getRequirement(Requirement requirement) const {
  return requirement >= 0 && requirement < kRequirementLast && fRequirements[requirement];
}

VNodeCacheDisablingInfo::VNodeCacheDisablingInfo() : fDisabled(false) {}
VNodeCacheDisablingInfo::VNodeCacheDisablingInfo(const VNodeCacheDisablingInfo &other) = default;
VNodeCacheDisablingInfo::~VNodeCacheDisablingInfo() = default;
VNodeCacheDisablingInfo &VNodeCacheDisablingInfo::operator=(const VNodeCacheDisablingInfo &other) =
    default;

void VNodeCacheDisablingInfo::setCacheDisabled(bool disabled) { fDisabled = disabled; }
bool VNodeCacheDisablingInfo::getCacheDisabled() const { return fDisabled; }
void VNodeCacheDisablingInfo::setReason(const VString &reason) { fReason = reason; }
VString VNodeCacheDisablingInfo::getReason() const { return fReason; }

VCacheSchema::VCacheSchema() = default;
VCacheSchema::VCacheSchema(const VCacheSchema &other) = default;
VCacheSchema::~VCacheSchema() = default;
VCacheSchema &VCacheSchema::operator=(const VCacheSchema &other) = default;

VStatus VCacheSchema::add(const VObject &attribute) {
  if (attribute.apiType() != VFn::kAttribute)
    return VStatus(VStatus::kInvalidParameter, "Only attributes can be cached");
  if (!contains(attribute)) fAttributes.push_back(attribute);
  return VStatus::kSuccess;
}

bool VCacheSchema::contains(const VObject &attribute) const {
  return std::find(fAttributes.begin(), fAttributes.end(), attribute) != fAttributes.end();
}

unsigned int VCacheSchema::length() const { return static_cast<unsigned int>(fAttributes.size()); }
void VCacheSchema::clear() { fAttributes.clear(); }

OPENVORLA_NAMESPACE_CLOSE
