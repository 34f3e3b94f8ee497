// Base class of plug-in filters of cache configuration rules.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxCacheConfigRuleFilter {
public:
  VPxCacheConfigRuleFilter();
  virtual ~VPxCacheConfigRuleFilter();
};

OPENVORLA_NAMESPACE_CLOSE
