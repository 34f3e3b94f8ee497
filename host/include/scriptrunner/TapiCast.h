// Access from the scripting engine to the engine storage inside SDK values.
#pragma once

#include <openvorla/VStringArray.h>

#include <basekit/TstringArray.h>

class T_EXPORT TapiCast {
public:
  static TstringArray &stringArray(OPENVORLA_NAMESPACE::VStringArray &array);
};
