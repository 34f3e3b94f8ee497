// VSelectionList: ordered lists of selected objects.
#include <openvorla/VSelectionList.h>

#include <algorithm>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus badIndex() {
  return VStatus(VStatus::kInvalidParameter, "Index not in the selection list");
}

}  // namespace

VSelectionList::VSelectionList() = default;
VSelectionList::VSelectionList(const VSelectionList &other) = default;
VSelectionList::~VSelectionList() = default;
VSelectionList &VSelectionList::operator=(const VSelectionList &other) = default;

VStatus VSelectionList::add(const VObject &object, bool mergeWithExisting) {
  if (object.isNull()) return VStatus(VStatus::kInvalidParameter, "Cannot select the null object");
  auto it = std::find(fItems.begin(), fItems.end(), object);
  if (it != fItems.end()) {
    if (mergeWithExisting) return VStatus::kSuccess;
    fItems.erase(it);
  }
  fItems.push_back(object);
  return VStatus::kSuccess;
}

VStatus VSelectionList::merge(const VSelectionList &other) {
  for (const VObject &object : other.fItems) add(object);
  return VStatus::kSuccess;
}

VStatus VSelectionList::remove(unsigned int index) {
  if (index >= fItems.size()) return badIndex();
  fItems.erase(fItems.begin() + index);
  return VStatus::kSuccess;
}

VStatus VSelectionList::getDependNode(unsigned int index, VObject &object) const {
  if (index >= fItems.size()) return badIndex();
  object = fItems[index];
  return VStatus::kSuccess;
}

VStatus VSelectionList::clear() {
  fItems.clear();
  return VStatus::kSuccess;
}

bool VSelectionList::hasItem(const VObject &object) const {
  return std::find(fItems.begin(), fItems.end(), object) != fItems.end();
}

unsigned int VSelectionList::length() const { return static_cast<unsigned int>(fItems.size()); }
bool VSelectionList::isEmpty() const { return fItems.empty(); }

OPENVORLA_NAMESPACE_CLOSE
