// Base class of the commands that create and edit plug-in constraints.
//
// A derived command names the attributes of its constraint node and of the
// constrained object through which the host connects the two; by default
// every one of them is the null object, and the host connects nothing.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxConstraint.h>
#include <openvorla/VTypeId.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxConstraintCommand : public VPxCommand {
public:
  enum TargetType {
    kTransform,
    kGeometryShape,
    kLast
  };

  VPxConstraintCommand();
  ~VPxConstraintCommand() override;

  // The constraint node's attributes.
  virtual const VObject &constraintInstancedAttribute() const;
  virtual const VObject &constraintOutputAttribute() const;
  virtual const VObject &constraintTargetInstancedAttribute() const;
  virtual const VObject &constraintTargetAttribute() const;
  virtual const VObject &constraintTargetWeightAttribute() const;
  virtual const VObject &offsetAttribute() const;
  // The constrained object's attribute that the constraint drives.
  virtual const VObject &objectAttribute() const;
  // The registered type of the constraint node; 0 by default.
  virtual VTypeId constraintTypeId() const;
  virtual TargetType targetType() const;  // kTransform
  // Whether the command takes the offset and vector flags; false by default.
  virtual bool supportsOffset() const;
  virtual bool hasVectorFlags() const;
  virtual bool hasUpVectorFlags() const;
  virtual bool hasWorldUpVectorFlags() const;

protected:
  // Called with each constraint node the command makes; does nothing by default.
  virtual void createdConstraint(VPxConstraint *constraint);
  // Appends the constrained object's attributes that the constraint drives:
  // objectAttribute() by default, unless it is null.
  virtual void getObjectAttributesArray(VObjectArray &array);
  // Appends the constraint's attributes that drive them, in the same order:
  // constraintOutputAttribute() by default, unless it is null.
  virtual void getOutputAttributes(VObjectArray &array);
};

OPENVORLA_NAMESPACE_CLOSE
