// Base of the function sets, which operate on a host object.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFn.h>
#include <openvorla/VObject.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnBase {
public:
  virtual ~VFnBase();

  virtual VFn::Type type() const;
  VObject object() const;  // the object operated on; null when none is attached
  // Whether this function set can operate on objects of the given kind.
  bool hasObj(VFn::Type type) const;

protected:
  VFnBase();
  explicit VFnBase(const VObject &object);  // attached to the object
  // Attaches the function set to another object; the null object detaches it.
  void setObject(const VObject &object);

private:
  VObject fObject;
};

OPENVORLA_NAMESPACE_CLOSE
