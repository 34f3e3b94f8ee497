// Color with red, green, blue and alpha components. 0 to 1 is the range a
// display shows; other values are kept as they are.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VColor {
public:
  VColor();  // opaque black
  VColor(float rr, float gg, float bb, float aa = 1.0f);
  VColor(const VColor &other);
  ~VColor();
  VColor &operator=(const VColor &other);

  // index 0 to 3: r, g, b, a.
  float operator[](unsigned int index) const;
  float &operator[](unsigned int index);

  // Component by component, alpha included.
  VColor operator+(const VColor &other) const;
  VColor operator*(const VColor &other) const;
  VColor operator*(float scale) const;

  bool operator==(const VColor &other) const;
  bool operator!=(const VColor &other) const;

  float r;
  float g;
  float b;
  float a;
};

OPENVORLA_NAMESPACE_CLOSE
