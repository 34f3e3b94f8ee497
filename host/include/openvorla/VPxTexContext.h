// Base class of plug-in contexts of the texture editor.
//
// The editor shows the rectangle viewRect() of UV space in a port of
// portSize() pixels, y up. The conversions below go between the two. Until
// the editor sets them, the port is 512 by 512 pixels showing 0 to 1 in u
// and v.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxContext.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxTexContext : public VPxContext {
public:
  VPxTexContext();
  ~VPxTexContext() override;

  void viewToPort(double x, double y, short &xPort, short &yPort) const;
  void portToView(short xPort, short yPort, double &x, double &y) const;
  void portSize(int &width, int &height) const;
  void viewRect(double &left, double &right, double &bottom, double &top) const;
  // kInvalidParameter for an empty rectangle or port.
  VStatus setPortSize(int width, int height);
  VStatus setViewRect(double left, double right, double bottom, double top);
  static const char *className();

private:
  int fWidth;
  int fHeight;
  double fLeft;
  double fRight;
  double fBottom;
  double fTop;
};

OPENVORLA_NAMESPACE_CLOSE
