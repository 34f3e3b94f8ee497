// Base of the attribute function sets: an attribute's names and the flags
// that say how the graph and the scene file treat it.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFn.h>
#include <openvorla/VFnBase.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnAttribute : public VFnBase {
public:
  VFnAttribute();  // attached to no attribute: every member fails or reads empty
  // kInvalidParameter, and nothing attached, for an object that is not an
  // attribute.
  VFnAttribute(const VObject &object, VStatus *ReturnStatus = NULL);
  ~VFnAttribute() override;

  VFn::Type type() const override;  // kAttribute

  // The long and the brief name.
  VString name() const;
  VString shortName() const;

  // New attributes are readable, writable and storable, neither keyable nor
  // hidden. A plug that is not writable is computed by its node.
  bool isKeyable(VStatus *ReturnStatus = NULL) const;
  bool isStorable(VStatus *ReturnStatus = NULL) const;
  bool isReadable(VStatus *ReturnStatus = NULL) const;
  bool isWritable(VStatus *ReturnStatus = NULL) const;
  bool isHidden(VStatus *ReturnStatus = NULL) const;
  VStatus setKeyable(bool state);
  VStatus setStorable(bool state);
  VStatus setReadable(bool state);
  VStatus setWritable(bool state);
  VStatus setHidden(bool state);

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
