// Base class of plug-in assemblies with switchable representations.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxAssembly : public VPxNode {
public:
  VPxAssembly();
  ~VPxAssembly() override;

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
};

OPENVORLA_NAMESPACE_CLOSE
