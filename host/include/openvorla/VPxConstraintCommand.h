// Base class of the commands that create and edit plug-in constraints.
//
// The command parses its arguments, makes the constraint node and connects
// it to the constrained object and to each target, through the attributes
// that a derived command names. By default every one of them is the null
// object and the host connects nothing. The forms of connectTarget and
// handleNewTargets with a modifier add their changes to it, so that the host
// can undo them.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VArgList.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VObject.h>
#include <openvorla/VObjectArray.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxConstraint.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class VDGModifier;

class OPENVORLA_EXPORT VPxConstraintCommand : public VPxCommand {
public:
  enum TargetType {
    kTransform,
    kGeometryShape,
    kLast
  };

  VPxConstraintCommand();
  ~VPxConstraintCommand() override;

  // The stand-in has no scene to constrain: doIt() reports parseArgs()'s
  // failure, else kNotImplemented, and there is nothing to undo or redo.
  VStatus doIt(const VArgList &args) override;
  VStatus undoIt() override;
  VStatus redoIt() override;
  bool isUndoable() const override;  // true
  // Adds the command's own flags to its syntax; kSuccess: it has none.
  virtual VStatus appendSyntax();
  static const char *className();

protected:
  // The arguments that are not the host's own flags; kSuccess by default.
  virtual VStatus parseArgs(const VArgList &argList);
  // Called with each constraint node the command makes; does nothing by default.
  virtual void createdConstraint(VPxConstraint *constraint);

  // The constraint node's attributes.
  virtual const VObject &constraintInstancedAttribute() const;
  virtual const VObject &constraintOutputAttribute() const;
  virtual const VObject &constraintTargetInstancedAttribute() const;
  virtual const VObject &constraintTargetAttribute() const;
  virtual const VObject &constraintTargetWeightAttribute() const;
  virtual const VObject &constraintRestAttribute() const;
  virtual const VObject &constraintEnableRestAttribute() const;
  virtual const VObject &offsetAttribute() const;
  virtual const VObject &aimVectorAttribute() const;
  virtual const VObject &upVectorAttribute() const;
  virtual const VObject &worldUpVectorAttribute() const;
  virtual const VObject &worldUpMatrixAttribute() const;
  virtual const VObject &worldUpTypeAttribute() const;
  // The constrained object's attribute that the constraint drives.
  virtual const VObject &objectAttribute() const;

  // The id of the registered type of the constraint node; 0 by default.
  virtual unsigned int constraintTypeId() const;
  virtual TargetType targetType() const;  // kTransform
  // Whether the command takes the offset and vector flags; false by default.
  virtual bool supportsOffset() const;
  virtual bool hasVectorFlags() const;
  virtual bool hasUpVectorFlags() const;
  virtual bool hasWorldUpVectorFlags() const;

  // Appends the constrained object's attributes that the constraint drives:
  // objectAttribute() by default, unless it is null.
  virtual void getObjectAttributesArray(VObjectArray &array);
  // Appends the constraint's attributes that drive them, in the same order:
  // constraintOutputAttribute() by default, unless it is null.
  virtual void getOutputAttributes(VObjectArray &array);

  // The connections, which need a scene: kNotImplemented in the stand-in.
  virtual VStatus connectTarget(VDagPath &targetPath, int index);
  virtual VStatus connectTarget(VDagPath &targetPath, int index, VDGModifier &modifier);
  virtual VStatus handleNewTargets(VObject &constraintNode);
  virtual VStatus handleNewTargets(VObject &constraintNode, VDGModifier &modifier);
  virtual VStatus connectObjectAndConstraint(VDGModifier &modifier);
  virtual VStatus setRestPosition(const VObject &constraintNode);
};

OPENVORLA_NAMESPACE_CLOSE
