// Forward declarations of SDK classes that headers name but do not define, and
// of the scripting engine's object type, which plug-in callables are passed as.
#pragma once

#include <openvorla/VApiVersion.h>

struct _object;
typedef _object PyObject;

OPENVORLA_NAMESPACE_OPEN

class VAttributePatternArray;
class VAttributeSpecArray;
class VRenderProfile;

OPENVORLA_NAMESPACE_CLOSE
