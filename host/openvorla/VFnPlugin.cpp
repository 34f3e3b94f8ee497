// VFnPlugin: the registration function set.
#include <openvorla/VFnPlugin.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VFnPlugin::VFnPlugin() { standin::noteConstructed("VFnPlugin"); }
VFnPlugin::~VFnPlugin() { standin::noteDestroyed("VFnPlugin"); }

const VString VFnPlugin::kDefaultDataLocation("default");

OPENVORLA_NAMESPACE_CLOSE
