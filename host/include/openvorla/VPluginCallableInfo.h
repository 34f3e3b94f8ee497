// What the host knows of a callable that a plug-in registered: the name it was
// registered under and the kind of procedure it stands for.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPluginCallableInfo {
public:
  VPluginCallableInfo();
  VPluginCallableInfo(const VString &name, const VString &kind);
  VPluginCallableInfo(const VPluginCallableInfo &other);
  ~VPluginCallableInfo();
  VPluginCallableInfo &operator=(const VPluginCallableInfo &other);

  VString name() const;
  VString kind() const;  // "creator", "initializer", ...
  void setName(const VString &name);
  void setKind(const VString &kind);

private:
  VString fName;
  VString fKind;
};

OPENVORLA_NAMESPACE_CLOSE
