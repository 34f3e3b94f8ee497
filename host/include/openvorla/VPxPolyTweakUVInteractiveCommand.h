// Tool command that moves UVs interactively.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VArgList.h>
#include <openvorla/VPxToolCommand.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxPolyTweakUVInteractiveCommand : public VPxToolCommand {
public:
  VPxPolyTweakUVInteractiveCommand();
  ~VPxPolyTweakUVInteractiveCommand() override;

  VStatus doIt(const VArgList &args) override;
};

OPENVORLA_NAMESPACE_CLOSE
