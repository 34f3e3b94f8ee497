// Base class of plug-in contexts that select objects.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxContext.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxSelectionContext : public VPxContext {
public:
  VPxSelectionContext();
  ~VPxSelectionContext() override;
};

OPENVORLA_NAMESPACE_CLOSE
