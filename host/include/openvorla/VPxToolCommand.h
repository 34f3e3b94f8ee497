// Base class of the commands that interactive tools run.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VArgList.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxToolCommand : public VPxCommand {
public:
  VPxToolCommand();
  ~VPxToolCommand() override;

  VStatus doIt(const VArgList &args) override = 0;
};

OPENVORLA_NAMESPACE_CLOSE
