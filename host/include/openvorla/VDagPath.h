// Path through the scene hierarchy: the nodes from below the world down to
// the node the path leads to.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <vector>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VDagPath {
public:
  VDagPath();  // the empty path, which is not valid
  VDagPath(const VDagPath &other);
  ~VDagPath();
  VDagPath &operator=(const VDagPath &other);

  // kInvalidParameter for the null object.
  VStatus push(const VObject &child);
  // kInvalidParameter when the path is shorter than count.
  VStatus pop(unsigned int count = 1);
  bool isValid() const;
  unsigned int length() const;
  // The last node; the null object for the empty path.
  VObject node(VStatus *ReturnStatus = NULL) const;
  // "|parent|child" from the nodes' names; "" for the empty path.
  VString fullPathName(VStatus *ReturnStatus = NULL) const;
  // The last node's name.
  VString partialPathName(VStatus *ReturnStatus = NULL) const;

  bool operator==(const VDagPath &other) const;
  bool operator!=(const VDagPath &other) const;

private:
  std::vector<VObject> fNodes;
};

OPENVORLA_NAMESPACE_CLOSE
