// The context in which the dependency graph evaluates: the current time
// (normal context) or a given time.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VTime.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VDGContext {
public:
  VDGContext();  // the normal context
  explicit VDGContext(const VTime &when);
  VDGContext(const VDGContext &other);
  ~VDGContext();
  VDGContext &operator=(const VDGContext &other);

  bool isNormal() const;
  // The time of a timed context; 0 seconds for the normal context.
  VTime getTime() const;

  bool operator==(const VDGContext &other) const;
  bool operator!=(const VDGContext &other) const;

private:
  bool fNormal;
  VTime fTime;
};

OPENVORLA_NAMESPACE_CLOSE
