// MaterialInputData: construction and destruction.
#include <openvorla/MaterialInputData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

MaterialInputData::MaterialInputData() { standin::noteConstructed("MaterialInputData"); }
MaterialInputData::~MaterialInputData() { standin::noteDestroyed("MaterialInputData"); }

OPENVORLA_NAMESPACE_CLOSE
