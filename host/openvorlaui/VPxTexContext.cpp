// VPxTexContext: the editor's port and the part of UV space it shows.
#include <openvorla/VPxTexContext.h>

#include <standin/Lifetime.h>

#include <cmath>

OPENVORLA_NAMESPACE_OPEN

VPxTexContext::VPxTexContext()
    : fWidth(512), fHeight(512), fLeft(0.0), fRight(1.0), fBottom(0.0), fTop(1.0) {
  standin::noteConstructed("VPxTexContext");
}

VPxTexContext::~VPxTexContext() { standin::noteDestroyed("VPxTexContext"); }

void VPxTexContext::viewToPort(double x, double y, short &xPort, short &yPort) const {
  xPort = static_cast<short>(std::lround((x - fLeft) / (fRight - fLeft) * fWidth));
  yPort = static_cast<short>(std::lround((y - fBottom) / (fTop - fBottom) * fHeight));
}

void VPxTexContext::portToView(short xPort, short yPort, double &x, double &y) const {
  x = fLeft + (fRight - fLeft) * xPort / fWidth;
  y = fBottom + (fTop - fBottom) * yPort / fHeight;
}

void VPxTexContext::portSize(int &width, int &height) const {
  width = fWidth;
  height = fHeight;
}

void VPxTexContext::viewRect(double &left, double &right, double &bottom, double &top) const {
  left = fLeft;
  right = fRight;
  bottom = fBottom;
  top = fTop;
}

VStatus VPxTexContext::setPortSize(int width, int height) {
  if (width <= 0 || height <= 0) return VStatus(VStatus::kInvalidParameter, "Empty port");
  fWidth = width;
  fHeight = height;
  return VStatus::kSuccess;
}

VStatus VPxTexContext::setViewRect(double left, double right, double bottom, double top) {
  if (!(left < right && bottom < top)) return VStatus(VStatus::kInvalidParameter, "Empty view");
  fLeft = left;
  fRight = right;
  fBottom = bottom;
  fTop = top;
  return VStatus::kSuccess;
}

const char *VPxTexContext::className() { return "VPxTexContext"; }

OPENVORLA_NAMESPACE_CLOSE
