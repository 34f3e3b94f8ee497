// Whether a node keeps the evaluation cache off, and why.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VNodeCacheDisablingInfo {
public:
  VNodeCacheDisablingInfo();  // caching allowed, no reason
  VNodeCacheDisablingInfo(const VNodeCacheDisablingInfo &other);
  ~VNodeCacheDisablingInfo();
  VNodeCacheDisablingInfo &operator=(const VNodeCacheDisablingInfo &other);

  void setCacheDisabled(bool disabled);
  bool getCacheDisabled() const;
  // Shown to the user when caching is off.
  void setReason(const VString &reason);
  VString getReason() const;

private:
  bool fDisabled;
  VString fReason;
};

OPENVORLA_NAMESPACE_CLOSE
