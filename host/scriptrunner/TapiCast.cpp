// TapiCast: the engine's view of SDK values.
#include <scriptrunner/TapiCast.h>

TstringArray &TapiCast::stringArray(OPENVORLA_NAMESPACE::VStringArray &array) {
  return array.fArray;
}
