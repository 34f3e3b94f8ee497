// Base class of plug-in contexts of the texture editor.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxContext.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxTexContext : public VPxContext {
public:
  VPxTexContext();
  ~VPxTexContext() override;
};

OPENVORLA_NAMESPACE_CLOSE
