// Base class of offscreen buffers that plug-ins draw into.
//
// A plug-in opens the buffer at the size it needs and draws into it between
// bindFbo() and unbindFbo(); the host calls beginBufferNotify() and
// endBufferNotify() around its own use of the buffer.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxGlBuffer {
public:
  VPxGlBuffer();
  virtual ~VPxGlBuffer();

  // kInvalidParameter for a size that is not positive. Opening an open buffer
  // resizes it.
  VStatus openbuffer(int width, int height);
  VStatus closebuffer();  // kFailure when it is not open

protected:
  // Do nothing by default.
  virtual void beginBufferNotify();
  virtual void endBufferNotify();

  // Makes the buffer the target of drawing, and the window again; kFailure
  // when the buffer is not open or, for unbindFbo, not bound.
  VStatus bindFbo();
  VStatus unbindFbo();
  bool isOpen() const;

private:
  int fWidth;
  int fHeight;
  bool fBound;
};

OPENVORLA_NAMESPACE_CLOSE
