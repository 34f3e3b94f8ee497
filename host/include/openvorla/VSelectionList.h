// Ordered list of selected objects. An object is listed once.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VSelectionList {
public:
  VSelectionList();
  VSelectionList(const VSelectionList &other);
  ~VSelectionList();
  VSelectionList &operator=(const VSelectionList &other);

  // kInvalidParameter for the null object; adding a listed object changes
  // nothing (it is moved to the end when not merged).
  VStatus add(const VObject &object, bool mergeWithExisting = true);
  // Adds the objects of the other list that this one lacks.
  VStatus merge(const VSelectionList &other);
  // kInvalidParameter when index is not below length().
  VStatus remove(unsigned int index);
  VStatus getDependNode(unsigned int index, VObject &object) const;
  VStatus clear();
  bool hasItem(const VObject &object) const;
  unsigned int length() const;
  bool isEmpty() const;

private:
  std::vector<VObject> fItems;
};

OPENVORLA_NAMESPACE_CLOSE
