// VPluginCallableInfo: the host's record of a registered callable.
#include <openvorla/VPluginCallableInfo.h>

OPENVORLA_NAMESPACE_OPEN

VPluginCallableInfo::VPluginCallableInfo() = default;
VPluginCallableInfo::VPluginCallableInfo(const VString &name, const VString &kind)
    : fName(name), fKind(kind) {}
VPluginCallableInfo::VPluginCallableInfo(const VPluginCallableInfo &other) = default;
VPluginCallableInfo::~VPluginCallableInfo() = default;
VPluginCallableInfo &VPluginCallableInfo::operator=(const VPluginCallableInfo &other) = default;

VString VPluginCallableInfo::name() const { return fName; }
VString VPluginCallableInfo::kind() const { return fKind; }
void VPluginCallableInfo::setName(const VString &name) { fName = name; }
void VPluginCallableInfo::setKind(const VString &kind) { fKind = kind; }

OPENVORLA_NAMESPACE_CLOSE
