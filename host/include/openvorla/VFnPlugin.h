// Function set through which a plug-in registers what it provides.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VFnBase.h>
#include <openvorla/VString.h>

#define PLUGIN_COMPANY "Halvern"

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFnPlugin : public VFnBase {
public:
  enum ImageFilePriority {
    kImageFilePriorityHighest = 0,
    kImageFilePriorityHigh = 10,
    kImageFilePriorityLow = 20,
    kImageFilePriorityLowest = 30,
    kImageFilePriorityDefault = kImageFilePriorityHigh
  };

  VFnPlugin();
  ~VFnPlugin() override;

  static const VString kDefaultDataLocation;
};

OPENVORLA_NAMESPACE_CLOSE
