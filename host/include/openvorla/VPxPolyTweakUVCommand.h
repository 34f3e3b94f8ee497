// Base class of plug-in commands that move the UVs of one mesh.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxCommand.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxPolyTweakUVCommand : public VPxCommand {
public:
  VPxPolyTweakUVCommand();
  ~VPxPolyTweakUVCommand() override;
};

OPENVORLA_NAMESPACE_CLOSE
