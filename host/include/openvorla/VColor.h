// Color with red, green, blue and alpha components, 0 to 1 for displayable
// colors. A new color is opaque black.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VColor {
public:
  VColor();
  VColor(float rr, float gg, float bb, float aa = 1.0f);
  VColor(const VColor &other);
  ~VColor();
  VColor &operator=(const VColor &other);

  bool operator==(const VColor &other) const;
  bool operator!=(const VColor &other) const;

  float r;
  float g;
  float b;
  float a;
};

OPENVORLA_NAMESPACE_CLOSE
