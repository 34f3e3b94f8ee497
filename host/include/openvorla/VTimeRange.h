// A closed range of times; empty when its end precedes its start.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VTime.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VTimeRange {
public:
  VTimeRange();  // empty
  VTimeRange(const VTime &start, const VTime &end);
  VTimeRange(const VTimeRange &other);
  ~VTimeRange();
  VTimeRange &operator=(const VTimeRange &other);

  VTime start() const;
  VTime end() const;
  bool isEmpty() const;
  bool contains(const VTime &time) const;

  // Empty ranges are all equal.
  bool operator==(const VTimeRange &other) const;
  bool operator!=(const VTimeRange &other) const;

private:
  VTime fStart;
  VTime fEnd;
};

OPENVORLA_NAMESPACE_CLOSE
