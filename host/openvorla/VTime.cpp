// VTime, VTimeRange and VDGContext: times, ranges of them, evaluation contexts.
#include <openvorla/VDGContext.h>
#include <openvorla/VTime.h>
#include <openvorla/VTimeRange.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

double secondsPer(VTime::Unit unit) {
  switch (unit) {
    case VTime::kHours:
      return 3600.0;
    case VTime::kMinutes:
      return 60.0;
    case VTime::kSeconds:
      return 1.0;
    case VTime::kMilliseconds:
      return 0.001;
    case VTime::kFilm:
      return 1.0 / 24.0;
    case VTime::kPALFrame:
      return 1.0 / 25.0;
    case VTime::kNTSCFrame:
      return 1.0 / 30.0;
    default:
      return 0.0;
  }
}

}  // namespace

VTime::VTime() : fValue(0.0), fUnit(kSeconds) {}
VTime::VTime(double value, Unit unit) : fValue(value), fUnit(unit) {}
VTime::VTime(const VTime &other) = default;
VTime::~VTime() = default;
VTime &VTime::operator=(const VTime &other) = default;

double VTime::value() const { return fValue; }
VTime::Unit VTime::unit() const { return fUnit; }

double VTime::as(Unit unit) const {
  double per = secondsPer(unit);
  return per == 0.0 ? 0.0 : fValue * secondsPer(fUnit) / per;
}

void VTime::setValue(double value) { fValue = value; }
void VTime::setUnit(Unit unit) { fUnit = unit; }

bool VTime::operator==(const VTime &o) const { return as(kSeconds) == o.as(kSeconds); }
bool VTime::operator!=(const VTime &o) const { return !(*this == o); }
bool VTime::operator<(const VTime &o) const { return as(kSeconds) < o.as(kSeconds); }
bool VTime::operator<=(const VTime &o) const { return !(o < *this); }
bool VTime::operator>(const VTime &o) const { return o < *this; }
bool VTime::operator>=(const VTime &o) const { return !(*this < o); }

VTimeRange::VTimeRange() : fStart(0.0), fEnd(-1.0) {}
VTimeRange::VTimeRange(const VTime &start, const VTime &end) : fStart(start), fEnd(end) {}
VTimeRange::VTimeRange(const VTimeRange &other) = default;
VTimeRange::~VTimeRange() = default;
VTimeRange &VTimeRange::operator=(const VTimeRange &other) = default;

VTime VTimeRange::start() const { return fStart; }
VTime VTimeRange::end() const { return fEnd; }
bool VTimeRange::isEmpty() const { return fEnd < fStart; }
bool VTimeRange::contains(const VTime &t) const { return fStart <= t && t <= fEnd; }

bool VTimeRange::operator==(const VTimeRange &o) const {
  if (isEmpty() || o.isEmpty()) return isEmpty() && o.isEmpty();
  return fStart == o.fStart && fEnd == o.fEnd;
}
bool VTimeRange::operator!=(const VTimeRange &o) const { return !(*this == o); }

VDGContext::VDGContext() : fNormal(true) {}
VDGContext::VDGContext(const VTime &when) : fNormal(false), fTime(when) {}
VDGContext::VDGContext(const VDGContext &other) = default;
VDGContext::~VDGContext() = default;
VDGContext &VDGContext::operator=(const VDGContext &other) = default;

bool VDGContext::isNormal() const { return fNormal; }
VTime VDGContext::getTime() const { return fTime; }

bool VDGContext::operator==(const VDGContext &o) const {
  return fNormal == o.fNormal && (fNormal || fTime == o.fTime);
}
bool VDGContext::operator!=(const VDGContext &o) const { return !(*this == o); }

OPENVORLA_NAMESPACE_CLOSE
