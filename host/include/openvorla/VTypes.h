// Forward declarations of SDK classes that headers name but do not define.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class VArgList;
class VAttributePatternArray;
class VPlug;
class VRenderProfile;
class VTime;

OPENVORLA_NAMESPACE_CLOSE
