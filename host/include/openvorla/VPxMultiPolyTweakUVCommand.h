// Base class of plug-in commands that move the UVs of several meshes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxCommand.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxMultiPolyTweakUVCommand : public VPxCommand {
public:
  VPxMultiPolyTweakUVCommand();
  ~VPxMultiPolyTweakUVCommand() override;
};

OPENVORLA_NAMESPACE_CLOSE
