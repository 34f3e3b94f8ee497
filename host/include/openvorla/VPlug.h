// A plug: one attribute of one node, or one element of an array attribute.
// Copies refer to the same plug.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPlug {
public:
  VPlug();  // the null plug
  VPlug(const VObject &node, const VObject &attribute);
  VPlug(const VPlug &other);
  ~VPlug();
  VPlug &operator=(const VPlug &other);

  // Null when it names no attribute.
  bool isNull() const;
  VObject node() const;
  VObject attribute() const;

  bool isElement() const;
  // The element index, or -1 when the plug is not an element.
  int logicalIndex() const;
  // The element of this plug's attribute at the index; an element plug gives
  // its sibling.
  VPlug elementByLogicalIndex(unsigned int index, VStatus *ReturnStatus = NULL) const;

  // "node.attribute" or "node.attribute[index]"; "" for the null plug.
  VString name() const;

  bool operator==(const VPlug &other) const;
  bool operator!=(const VPlug &other) const;

private:
  VObject fNode;
  VObject fAttribute;
  int fIndex;
};

OPENVORLA_NAMESPACE_CLOSE
