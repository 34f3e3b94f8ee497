// Base class of the commands that interactive tools run.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VStatus.h>
#include <openvorla/VTypes.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxToolCommand : public VPxCommand {
public:
  VPxToolCommand();
  ~VPxToolCommand() override;

  virtual VStatus doIt(const VArgList &args) = 0;
};

OPENVORLA_NAMESPACE_CLOSE
