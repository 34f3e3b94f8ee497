// Base class of the commands that create plug-in model editors.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxModelEditorCommand {
public:
  VPxModelEditorCommand();
  virtual ~VPxModelEditorCommand();
};

OPENVORLA_NAMESPACE_CLOSE
