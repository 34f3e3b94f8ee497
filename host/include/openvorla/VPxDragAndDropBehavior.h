// Base class of plug-in drag-and-drop behaviours.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxDragAndDropBehavior {
public:
  VPxDragAndDropBehavior();
  virtual ~VPxDragAndDropBehavior();
};

OPENVORLA_NAMESPACE_CLOSE
