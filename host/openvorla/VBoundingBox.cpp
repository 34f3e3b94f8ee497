// VBoundingBox: axis-aligned boxes.
#include <openvorla/VBoundingBox.h>

#include <algorithm>
#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VBoundingBox::VBoundingBox() : fEmpty(true) {}

VBoundingBox::VBoundingBox(const VPoint &corner1, const VPoint &corner2) : fEmpty(true) {
  expand(corner1);
  expand(corner2);
}

VBoundingBox::VBoundingBox(const VBoundingBox &other) = default;
VBoundingBox::~VBoundingBox() = default;
VBoundingBox &VBoundingBox::operator=(const VBoundingBox &other) = default;

void VBoundingBox::clear() {
  fMin = fMax = VPoint();
  fEmpty = true;
}

bool VBoundingBox::isEmpty() const { return fEmpty; }

void VBoundingBox::expand(const VPoint &point) {
  VVector p = point.asVector();
  if (fEmpty) {
    fMin = fMax = VPoint(p);
    fEmpty = false;
    return;
  }
  fMin = VPoint(std::min(fMin.x, p.x), std::min(fMin.y, p.y), std::min(fMin.z, p.z));
  fMax = VPoint(std::max(fMax.x, p.x), std::max(fMax.y, p.y), std::max(fMax.z, p.z));
}

void VBoundingBox::expand(const VBoundingBox &box) {
  if (box.fEmpty) return;
  expand(box.fMin);
  expand(box.fMax);
}

void VBoundingBox::transformUsing(const VMatrix &matrix) {
  if (fEmpty) return;
  VBoundingBox result;
  for (int corner = 0; corner < 8; ++corner) {
    VPoint p((corner & 1) ? fMax.x : fMin.x, (corner & 2) ? fMax.y : fMin.y,
             (corner & 4) ? fMax.z : fMin.z);
    result.expand(p * matrix);
  }
  *this = result;
}

bool VBoundingBox::contains(const VPoint &point) const {
  if (fEmpty) return false;
  VVector p = point.asVector();
  return p.x >= fMin.x && p.x <= fMax.x && p.y >= fMin.y && p.y <= fMax.y && p.z >= fMin.z &&
         p.z <= fMax.z;
}

bool VBoundingBox::intersects(const VBoundingBox &box, double tolerance) const {
  if (fEmpty || box.fEmpty) return false;
  return fMin.x <= box.fMax.x + tolerance && box.fMin.x <= fMax.x + tolerance &&
         fMin.y <= box.fMax.y + tolerance && box.fMin.y <= fMax.y + tolerance &&
         fMin.z <= box.fMax.z + tolerance && box.fMin.z <= fMax.z + tolerance;
}

VPoint VBoundingBox::min() const { return fMin; }
VPoint VBoundingBox::max() const { return fMax; }

VPoint VBoundingBox::center() const {
  return VPoint((fMin.x + fMax.x) / 2, (fMin.y + fMax.y) / 2, (fMin.z + fMax.z) / 2);
}

double VBoundingBox::width() const { return fMax.x - fMin.x; }
double VBoundingBox::height() const { return fMax.y - fMin.y; }
double VBoundingBox::depth() const { return fMax.z - fMin.z; }

bool VBoundingBox::operator==(const VBoundingBox &other) const {
  if (fEmpty || other.fEmpty) return fEmpty == other.fEmpty;
  return fMin == other.fMin && fMax == other.fMax;
}

bool VBoundingBox::operator!=(const VBoundingBox &other) const { return !(*this == other); }

OPENVORLA_NAMESPACE_CLOSE
