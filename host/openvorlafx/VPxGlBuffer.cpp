// VPxGlBuffer: the buffer's size and binding, kept without a drawing context.
#include <openvorla/VPxGlBuffer.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus notOpen() { return VStatus(VStatus::kFailure, "The buffer is not open"); }

}  // namespace

VPxGlBuffer::VPxGlBuffer() : fWidth(0), fHeight(0), fBound(false) {
  standin::noteConstructed("VPxGlBuffer");
}

VPxGlBuffer::~VPxGlBuffer() { standin::noteDestroyed("VPxGlBuffer"); }

VStatus VPxGlBuffer::openbuffer(int width, int height) {
  if (width <= 0 || height <= 0)
    return VStatus(VStatus::kInvalidParameter, "A buffer needs a positive size");
  fWidth = width;
  fHeight = height;
  return VStatus::kSuccess;
}

VStatus VPxGlBuffer::closebuffer() {
  if (!isOpen()) return notOpen();
  fWidth = fHeight = 0;
  fBound = false;
  return VStatus::kSuccess;
}

void VPxGlBuffer::beginBufferNotify() {}
void VPxGlBuffer::endBufferNotify() {}

VStatus VPxGlBuffer::bindFbo() {
  if (!isOpen()) return notOpen();
  fBound = true;
  return VStatus::kSuccess;
}

VStatus VPxGlBuffer::unbindFbo() {
  if (!fBound) return VStatus(VStatus::kFailure, "The buffer is not bound");
  fBound = false;
  return VStatus::kSuccess;
}

bool VPxGlBuffer::isOpen() const { return fWidth > 0; }

OPENVORLA_NAMESPACE_CLOSE
