// VExternalContentLocationTable: locations by key, in the order added.
#include <openvorla/VExternalContentLocationTable.h>

#include <standin/Lifetime.h>

#include <utility>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

struct VExternalContentLocationTable::Entries {
  std::vector<std::pair<VString, VString>> items;
};

VExternalContentLocationTable::VExternalContentLocationTable() : fEntries(new Entries) {
  standin::noteConstructed("VExternalContentLocationTable");
}
VExternalContentLocationTable::~VExternalContentLocationTable() {
  standin::noteDestroyed("VExternalContentLocationTable");
}

VStatus VExternalContentLocationTable::addEntry(const VString &key, const VString &location) {
  if (key.length() == 0)
    return VStatus(VStatus::kInvalidParameter, "A location entry needs a key");
  for (auto &item : fEntries->items)
    if (item.first == key) {
      item.second = location;
      return VStatus::kSuccess;
    }
  fEntries->items.emplace_back(key, location);
  return VStatus::kSuccess;
}

unsigned int VExternalContentLocationTable::length() const {
  return static_cast<unsigned int>(fEntries->items.size());
}

VStatus VExternalContentLocationTable::getLocation(const VString &key, VString &location) const {
  for (const auto &item : fEntries->items)
    if (item.first == key) {
      location = item.second;
      return VStatus::kSuccess;
    }
  return VStatus(VStatus::kNotFound, VString("No location for '") + key + "'");
}

VStatus VExternalContentLocationTable::getEntry(unsigned int index, VString &key,
                                                VString &location) const {
  if (index >= fEntries->items.size())
    return VStatus(VStatus::kNotFound, "No location entry at that index");
  key = fEntries->items[index].first;
  location = fEntries->items[index].second;
  return VStatus::kSuccess;
}

OPENVORLA_NAMESPACE_CLOSE
