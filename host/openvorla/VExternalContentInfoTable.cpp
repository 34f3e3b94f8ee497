// VExternalContentInfoTable: entries kept in the order they were added.
#include <openvorla/VExternalContentInfoTable.h>

#include <standin/Lifetime.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

struct VExternalContentInfoTable::Entries {
  struct Entry {
    VString key, unresolved, resolved, context;
    VStringArray roots;
  };
  std::vector<Entry> items;

  VStatus add(const VString &key, const VString &unresolved, const VString &resolved,
              const VString &context, const VStringArray &roots) {
    if (key.length() == 0)
      return VStatus(VStatus::kInvalidParameter, "An external content entry needs a key");
    for (const Entry &e : items)
      if (e.key == key)
        return VStatus(VStatus::kInvalidParameter,
                       VString("The external content key '") + key + "' is already in the table");
    items.push_back({key, unresolved, resolved, context, roots});
    return VStatus::kSuccess;
  }

  static VStatus fill(const Entry &e, VString &key, VString &unresolved, VString &resolved,
                      VString &context, VStringArray &roots, const VString &required) {
    if (required.length() != 0 && !(e.context == required))
      return VStatus(VStatus::kNotFound,
                     VString("The entry '") + e.key + "' does not belong to '" + required + "'");
    key = e.key;
    unresolved = e.unresolved;
    resolved = e.resolved;
    context = e.context;
    roots = e.roots;
    return VStatus::kSuccess;
  }
};

VExternalContentInfoTable::VExternalContentInfoTable() : fEntries(new Entries) {
  standin::noteConstructed("VExternalContentInfoTable");
}
VExternalContentInfoTable::~VExternalContentInfoTable() {
  standin::noteDestroyed("VExternalContentInfoTable");
}

VStatus VExternalContentInfoTable::addResolvedEntry(const VString &key, const VString &unresolved,
                                                    const VString &resolved,
                                                    const VStringArray &roots) {
  return fEntries->add(key, unresolved, resolved, VString(), roots);
}
VStatus VExternalContentInfoTable::addResolvedEntry(const VString &key, const VString &unresolved,
                                                    const VString &resolved,
                                                    const VString &context,
                                                    const VStringArray &roots) {
  return fEntries->add(key, unresolved, resolved, context, roots);
}
VStatus VExternalContentInfoTable::addUnresolvedEntry(const VString &key,
                                                      const VString &unresolved,
                                                      const VStringArray &roots) {
  return fEntries->add(key, unresolved, VString(), VString(), roots);
}
VStatus VExternalContentInfoTable::addUnresolvedEntry(const VString &key,
                                                      const VString &unresolved,
                                                      const VString &context,
                                                      const VStringArray &roots) {
  return fEntries->add(key, unresolved, VString(), context, roots);
}
unsigned int VExternalContentInfoTable::length() const {
  return static_cast<unsigned int>(fEntries->items.size());
}

VStatus VExternalContentInfoTable::getEntry(unsigned int index, VString &key, VString &unresolved,
                                            VString &resolved, VString &context,
                                            VStringArray &roots, const VString &required) const {
  if (index >= fEntries->items.size())
    return VStatus(VStatus::kNotFound, "No external content entry at that index");
  return Entries::fill(fEntries->items[index], key, unresolved, resolved, context, roots,
                       required);
}

VStatus VExternalContentInfoTable::getInfo(const VString &wanted, VString &key,
                                           VString &unresolved, VString &resolved,
                                           VString &context, VStringArray &roots,
                                           const VString &required) const {
  for (const auto &e : fEntries->items)
    if (e.key == wanted) return Entries::fill(e, key, unresolved, resolved, context, roots, required);
  return VStatus(VStatus::kNotFound, VString("No external content entry for '") + wanted + "'");
}

OPENVORLA_NAMESPACE_CLOSE
