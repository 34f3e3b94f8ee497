// Base class of plug-in readers of image file formats.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxImageFile {
public:
  VPxImageFile();
  virtual ~VPxImageFile();
};

OPENVORLA_NAMESPACE_CLOSE
