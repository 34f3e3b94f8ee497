// What the evaluation manager tells a node about its evaluation: the node and
// the plugs dirtied since it was last evaluated.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPlugArray.h>
#include <openvorla/VStatus.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VEvaluationNode {
public:
  VEvaluationNode();
  VEvaluationNode(const VObject &node, const VPlugArray &dirtyPlugs);
  VEvaluationNode(const VEvaluationNode &other);
  ~VEvaluationNode();
  VEvaluationNode &operator=(const VEvaluationNode &other);

  // kInvalidParameter, and the null object, when no node is evaluated.
  VObject dependencyNode(VStatus *ReturnStatus = NULL) const;
  // Whether a dirty plug has this attribute, element plugs included.
  bool dirtyPlugExists(const VObject &attribute, VStatus *ReturnStatus = NULL) const;
  unsigned int dirtyPlugCount() const;
  // The null plug for an index not below dirtyPlugCount().
  VPlug dirtyPlug(unsigned int index) const;

private:
  VObject fNode;
  VPlugArray fDirtyPlugs;
};

OPENVORLA_NAMESPACE_CLOSE
