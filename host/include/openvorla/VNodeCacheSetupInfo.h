// How a node would like the evaluation cache to treat it.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VNodeCacheSetupInfo {
public:
  enum Preference {
    kWantToCacheByDefault,
    kPreferenceLast
  };

  enum Requirement {
    kSimulationSupport,
    kRequirementLast
  };

  VNodeCacheSetupInfo();  // nothing preferred or required
  VNodeCacheSetupInfo(const VNodeCacheSetupInfo &other);
  ~VNodeCacheSetupInfo();
  VNodeCacheSetupInfo &operator=(const VNodeCacheSetupInfo &other);

  // Values out of range are ignored and read as false.
  void setPreference(Preference preference, bool value);
  bool getPreference(Preference preference) const;
  void setRequirement(Requirement requirement, bool value);
  bool getRequirement(Requirement requirement) const;

private:
  bool fPreferences[kPreferenceLast];
  bool fRequirements[kRequirementLast];
};

OPENVORLA_NAMESPACE_CLOSE
