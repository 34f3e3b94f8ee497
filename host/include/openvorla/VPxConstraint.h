// Base class of plug-in constraint nodes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxConstraint : public VPxNode {
public:
  enum WorldUpType {
    kScene,
    kObject,
    kObjectRotation,
    kVector,
    kLast
  };

  VPxConstraint();
  ~VPxConstraint() override;

  // The attributes through which the host drives the constraint: the
  // targets' weights, the targets, and the constrained object's rotate
  // order. The null object by default.
  virtual const VObject weightAttribute() const;
  virtual const VObject targetAttribute() const;
  virtual const VObject constraintRotateOrderAttribute() const;
  static const char *className();

  static VObject enableRestPosition;
  static VObject lockOutput;

protected:
  // The output that the constraint only passes on (the host does not
  // evaluate it to draw), and every output attribute, for derived
  // constraints to answer.
  virtual const VObject passiveOutputAttribute() const;
  virtual void getOutputAttributes(VObjectArray &attributeArray);
};

OPENVORLA_NAMESPACE_CLOSE
