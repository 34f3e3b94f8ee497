// A time value in a unit.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VTime {
public:
  enum Unit {
    kInvalid,
    kHours,
    kMinutes,
    kSeconds,
    kMilliseconds,
    kFilm,       // 24 frames per second
    kPALFrame,   // 25 frames per second
    kNTSCFrame,  // 30 frames per second
    kLast
  };

  VTime();  // 0 seconds
  VTime(double value, Unit unit = kSeconds);
  VTime(const VTime &other);
  ~VTime();
  VTime &operator=(const VTime &other);

  double value() const;
  Unit unit() const;
  // The same time in another unit; 0 for kInvalid and kLast.
  double as(Unit unit) const;
  void setValue(double value);
  // Changes the unit and keeps the value, so the time changes.
  void setUnit(Unit unit);

  // Times compare by the moment they stand for, whatever their units.
  bool operator==(const VTime &other) const;
  bool operator!=(const VTime &other) const;
  bool operator<(const VTime &other) const;
  bool operator<=(const VTime &other) const;
  bool operator>(const VTime &other) const;
  bool operator>=(const VTime &other) const;

private:
  double fValue;
  Unit fUnit;
};

OPENVORLA_NAMESPACE_CLOSE
