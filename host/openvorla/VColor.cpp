// VColor: a color value.
#include <openvorla/VColor.h>

OPENVORLA_NAMESPACE_OPEN

VColor::VColor() : r(0.0f), g(0.0f), b(0.0f), a(1.0f) {}
VColor::VColor(float rr, float gg, float bb, float aa) : r(rr), g(gg), b(bb), a(aa) {}
VColor::VColor(const VColor &other) = default;
VColor::~VColor() = default;
VColor &VColor::operator=(const VColor &other) = default;

float VColor::operator[](unsigned int index) const {
  return index == 0 ? r : index == 1 ? g : index == 2 ? b : a;
}

float &VColor::operator[](unsigned int index) {
  return index == 0 ? r : index == 1 ? g : index == 2 ? b : a;
}

VColor VColor::operator+(const VColor &o) const {
  return VColor(r + o.r, g + o.g, b + o.b, a + o.a);
}
VColor VColor::operator*(const VColor &o) const {
  return VColor(r * o.r, g * o.g, b * o.b, a * o.a);
}
VColor VColor::operator*(float s) const { return VColor(r * s, g * s, b * s, a * s); }

bool VColor::operator==(const VColor &o) const {
  return r == o.r && g == o.g && b == o.b && a == o.a;
}

bool VColor::operator!=(const VColor &o) const { return !(*this == o); }

OPENVORLA_NAMESPACE_CLOSE
