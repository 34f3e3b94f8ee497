// Base class of plug-in assemblies with switchable representations.
//
// An assembly node stands for a part of the scene that it can show in
// several representations (a bounding box, a proxy, the full geometry), one
// of them active at a time. The derived class keeps the representations;
// the host asks it to create, activate, rename and delete them, and tells it
// about saving, loading, members and the edits made to them.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxAssembly : public VPxNode {
public:
  VPxAssembly();
  ~VPxAssembly() override;

  VPxNode::Type type() const override;  // kAssembly
  // Activates the initial representation, if there is one.
  void postConstructor() override;

  virtual VString createRepresentation(const VString &input, const VString &type,
                                       const VString &parameters) = 0;
  virtual VStringArray getRepresentations() const = 0;
  virtual VString getActive() const = 0;
  virtual bool activateRep(const VString &representation) = 0;
  virtual VStringArray repTypes() const = 0;
  virtual VStatus deleteRepresentation(const VString &representation) = 0;
  virtual VStatus deleteAllRepresentations() = 0;
  virtual VString getRepType(const VString &representation) const = 0;
  virtual VString getRepLabel(const VString &representation) const = 0;
  virtual VString setRepName(const VString &representation, const VString &newName) = 0;
  virtual VStatus setRepLabel(const VString &representation, const VString &label) = 0;

  // The number of representations: the length of getRepresentations().
  virtual unsigned int repCount() const;
  // The representation to activate when the assembly is made or loaded; ""
  // by default: none. The second form also tells whether there is one.
  virtual VString getInitialRep() const;
  virtual VString getInitialRep(bool &hasInitialRep) const;
  // Inactivates the active representation; true by default: nothing to do.
  virtual bool inactivateRep();
  // Called around activateRep(); they do nothing by default.
  virtual void preActivateRep(const VString &representation);
  virtual void postActivateRep(const VString &representation);
  // Whether the user may rename or delete a representation; true by default.
  virtual bool canRenameRepresentation(const VString &representation) const;
  virtual bool canDeleteRepresentation(const VString &representation) const;

  // The namespace the members of the active representation live in; "" by
  // default, the root namespace. The host renames it with updateRepNamespace.
  virtual VString getRepNamespace() const;
  virtual void updateRepNamespace(const VString &repNamespace);

  // Edits of the members: whether the assembly takes them at all, whether a
  // representation applies them, whether the assembly itself applies the
  // edits that add or remove members, and the bracket around their
  // application. Edits are not supported by default.
  virtual bool supportsEdits() const;
  virtual bool canRepApplyEdits(const VString &representation) const;
  virtual bool handlesAddEdits() const;
  virtual bool handlesRemoveEdits() const;
  virtual void preApplyEdits();
  virtual void postApplyEdits();

  // Whether members may be added or removed by the user; false by default.
  virtual bool supportsMemberChanges() const;
  virtual void memberAdded(VObject &member);
  virtual void memberRemoved(VObject &member);
  // Called before the scene is saved and after it is loaded; nothing by default.
  virtual void beforeSave();
  virtual void postLoad();

  // Activates a representation as the host does: preActivateRep(),
  // inactivateRep(), activateRep() and postActivateRep(). kInvalidParameter
  // for a name that getRepresentations() does not list, kFailure when the
  // inactivation or the activation fails.
  VStatus activate(const VString &representation);
  // Whether activate() is running.
  bool isActivating() const;
  // Whether the assembly is not a member of another assembly.
  bool isTopLevel() const;

  // The edits recorded on the members, as the command lines that make them.
  VStatus addEdit(const VString &command);
  VStatus removeEdit(unsigned int index);  // kInvalidParameter past the end
  VStatus clearEdits();
  VStringArray edits() const;
  unsigned int editCount() const;
  bool hasEdits() const;
  static const char *className();

protected:
  // Tells the host that the active representation changed outside activate(),
  // for it to refresh the views and the outliner.
  void notifyRepChanged();

private:
  bool fActivating;
  VStringArray fEdits;
};

OPENVORLA_NAMESPACE_CLOSE
