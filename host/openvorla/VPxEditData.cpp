// VPxEditData: comparisons through the plug-in's own, and the named values.
#include <openvorla/VPxEditData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus noValue() { return VStatus(VStatus::kNotFound, "The edit data has no value of that name"); }

}  // namespace

VPxEditData::VPxEditData() { standin::noteConstructed("VPxEditData"); }
VPxEditData::~VPxEditData() { standin::noteDestroyed("VPxEditData"); }

bool VPxEditData::operator==(const VPxEditData &other) const { return performIsEqual(other); }
bool VPxEditData::operator!=(const VPxEditData &other) const { return !performIsEqual(other); }
bool VPxEditData::operator<(const VPxEditData &other) const { return performIsLessThan(other); }

VStatus VPxEditData::setValue(const VString &name, const VString &value) {
  if (name.numChars() == 0) return VStatus(VStatus::kInvalidParameter, "A value needs a name");
  for (auto &entry : fValues) {
    if (entry.first == name) {
      entry.second = value;
      return VStatus::kSuccess;
    }
  }
  fValues.emplace_back(name, value);
  return VStatus::kSuccess;
}

VString VPxEditData::value(const VString &name, VStatus *ReturnStatus) const {
  for (const auto &entry : fValues) {
    if (entry.first == name) {
      if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
      return entry.second;
    }
  }
  if (ReturnStatus) *ReturnStatus = noValue();
  return VString();
}

bool VPxEditData::hasValue(const VString &name) const {
  for (const auto &entry : fValues)
    if (entry.first == name) return true;
  return false;
}

VStatus VPxEditData::removeValue(const VString &name) {
  for (auto it = fValues.begin(); it != fValues.end(); ++it) {
    if (it->first == name) {
      fValues.erase(it);
      return VStatus::kSuccess;
    }
  }
  return noValue();
}

VStringArray VPxEditData::valueNames() const {
  VStringArray names;
  for (const auto &entry : fValues) names.append(entry.first);
  return names;
}

unsigned int VPxEditData::valueCount() const { return static_cast<unsigned int>(fValues.size()); }
const char *VPxEditData::className() { return "VPxEditData"; }

OPENVORLA_NAMESPACE_CLOSE
