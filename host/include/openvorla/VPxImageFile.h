// Base class of plug-in readers of image file formats.
//
// The host opens a file through the reader registered for its extension,
// loads its images into the host's image or into the current texture, and
// closes it. The host's defaults read nothing: every step reports
// kNotImplemented.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

OPENVORLA_NAMESPACE_OPEN

class VImage;
class VImageFileInfo;

class OPENVORLA_EXPORT VPxImageFile {
public:
  VPxImageFile();
  virtual ~VPxImageFile();

protected:
  // Opens the file and describes its images in info, when info is not null.
  virtual VStatus open(const VString &pathname, VImageFileInfo *info);
  // Reads image imageNumber of the file into image.
  virtual VStatus load(VImage &image, unsigned int imageNumber);
  // The same into the texture bound in the current drawing context.
  virtual VStatus glLoad(const VImageFileInfo &info, unsigned int imageNumber);
  virtual VStatus close();
};

OPENVORLA_NAMESPACE_CLOSE
