// Base class of the representations of plug-in assemblies.
//
// An assembly makes one representation object for each of its
// representations and activates one at a time.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VExternalContentInfoTable.h>
#include <openvorla/VExternalContentLocationTable.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class VPxAssembly;

class OPENVORLA_EXPORT VPxRepresentation {
public:
  // The representation named name of the assembly, which may be null.
  VPxRepresentation(VPxAssembly *assembly, const VString &name);
  virtual ~VPxRepresentation();

  virtual bool activate() = 0;
  // Undoes what activate() did; true by default: nothing to undo.
  virtual bool inactivate();
  virtual VString getType() const = 0;
  // Whether the edits of the assembly apply to the representation; false.
  virtual bool canApplyEdits() const;
  // The files the representation reads, as VPxNode's external content: none
  // by default.
  virtual void getExternalContent(VExternalContentInfoTable &table) const;
  virtual void setExternalContent(const VExternalContentLocationTable &table);

  VString getName() const;
  static const char *className();

private:
  VPxAssembly *fAssembly;
  VString fName;
};

OPENVORLA_NAMESPACE_CLOSE
