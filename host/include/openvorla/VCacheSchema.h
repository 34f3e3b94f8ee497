// The attributes whose values the evaluation cache keeps for a node.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VCacheSchema {
public:
  VCacheSchema();
  VCacheSchema(const VCacheSchema &other);
  ~VCacheSchema();
  VCacheSchema &operator=(const VCacheSchema &other);

  // kInvalidParameter for an object that is not an attribute; adding an
  // attribute twice keeps one entry.
  VStatus add(const VObject &attribute);
  bool contains(const VObject &attribute) const;
  unsigned int length() const;
  void clear();

private:
  std::vector<VObject> fAttributes;
};

OPENVORLA_NAMESPACE_CLOSE
