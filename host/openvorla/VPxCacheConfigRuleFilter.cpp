// VPxCacheConfigRuleFilter: construction and destruction.
#include <openvorla/VPxCacheConfigRuleFilter.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxCacheConfigRuleFilter::VPxCacheConfigRuleFilter() {
  standin::noteConstructed("VPxCacheConfigRuleFilter");
}
VPxCacheConfigRuleFilter::~VPxCacheConfigRuleFilter() {
  standin::noteDestroyed("VPxCacheConfigRuleFilter");
}

OPENVORLA_NAMESPACE_CLOSE
