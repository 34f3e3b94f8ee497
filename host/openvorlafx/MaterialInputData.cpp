// MaterialInputData: the values a material starts with.
#include <openvorla/MaterialInputData.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

MaterialInputData::MaterialInputData()
    : shininess(0.0f),
      ambient(0.0f, 0.0f, 0.0f),
      diffuse(0.5f, 0.5f, 0.5f),
      emission(0.0f, 0.0f, 0.0f),
      specular(0.0f, 0.0f, 0.0f),
      hasTransparency(false) {
  standin::noteConstructed("MaterialInputData");
}

MaterialInputData::~MaterialInputData() { standin::noteDestroyed("MaterialInputData"); }

OPENVORLA_NAMESPACE_CLOSE
