// Material values that a material information object computes for the viewport.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VColor.h>

OPENVORLA_NAMESPACE_OPEN

struct OPENVORLA_EXPORT MaterialInputData {
  // A matte grey surface: no emission or specular highlight, opaque.
  MaterialInputData();
  ~MaterialInputData();

  float shininess;
  VColor ambient;
  VColor diffuse;
  VColor emission;
  VColor specular;
  bool hasTransparency;
};

OPENVORLA_NAMESPACE_CLOSE
