// Base class of plug-in filters of cache configuration rules.
//
// Before the evaluation cache is set up, the host runs its configuration
// rules; a rule with a filter applies to the nodes the filter matches. The
// host's default filter matches every node.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxCacheConfigRuleFilter {
public:
  VPxCacheConfigRuleFilter();
  // With the text the cache preferences show for the filter.
  explicit VPxCacheConfigRuleFilter(const VString &description);
  virtual ~VPxCacheConfigRuleFilter();

protected:
  // Called once before and once after the rules run over the nodes, for the
  // filter to gather and drop what isMatch() needs; they do nothing by default.
  virtual void preRulesExecution();
  virtual void postRulesExecution();
  virtual bool isMatch(const VObject &evaluationNode);

private:
  VString fDescription;
};

OPENVORLA_NAMESPACE_CLOSE
