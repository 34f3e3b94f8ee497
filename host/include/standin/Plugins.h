// Stand-in only: the host's side of loading plug-ins, for tests and for the
// host's plug-in loader.
#pragma once

#include <openvorla/VObject.h>

namespace standin {

// A new plug-in object with its record in the table of loaded plug-ins.
// The name is made unique as VFnPlugin::setName does.
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VObject loadPlugin(const char *name, const char *loadPath);
// Forgets the plug-in: function sets attached to it read empty and fail.
OPENVORLA_EXPORT void unloadPlugin(const OPENVORLA_NAMESPACE::VObject &plugin);
OPENVORLA_EXPORT void unloadAllPlugins();

}  // namespace standin
