// VColor: a color value.
#include <openvorla/VColor.h>

OPENVORLA_NAMESPACE_OPEN

VColor::VColor() : r(0.0f), g(0.0f), b(0.0f), a(1.0f) {}
VColor::VColor(float rr, float gg, float bb, float aa) : r(rr), g(gg), b(bb), a(aa) {}
VColor::VColor(const VColor &other) = default;
VColor::~VColor() = default;
VColor &VColor::operator=(const VColor &other) = default;

bool VColor::operator==(const VColor &other) const {
  return r == other.r && g == other.g && b == other.b && a == other.a;
}

bool VColor::operator!=(const VColor &other) const { return !(*this == other); }

OPENVORLA_NAMESPACE_CLOSE
