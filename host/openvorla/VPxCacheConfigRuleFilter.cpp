// VPxCacheConfigRuleFilter: the host's default filter, which matches every node.
#include <openvorla/VPxCacheConfigRuleFilter.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxCacheConfigRuleFilter::VPxCacheConfigRuleFilter() {
  standin::noteConstructed("VPxCacheConfigRuleFilter");
}

VPxCacheConfigRuleFilter::VPxCacheConfigRuleFilter(const VString &description)
    : fDescription(description) {
  standin::noteConstructed("VPxCacheConfigRuleFilter");
}

VPxCacheConfigRuleFilter::~VPxCacheConfigRuleFilter() {
  standin::noteDestroyed("VPxCacheConfigRuleFilter");
}

void VPxCacheConfigRuleFilter::preRulesExecution() {}
void VPxCacheConfigRuleFilter::postRulesExecution() {}
bool VPxCacheConfigRuleFilter::isMatch(const VObject &) { return true; }

OPENVORLA_NAMESPACE_CLOSE
