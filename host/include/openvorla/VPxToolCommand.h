// Base class of the commands that interactive tools run.
//
// A context makes the tool command when the tool starts and changes its
// values as the user drags; finalize() then records the command for undo and
// the history, and cancel() undoes what the tool did.
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
  // kNotImplemented by default.
  virtual VStatus cancel();
  virtual VStatus finalize();

  // For finalize(): records the command line that the tool amounts to, which
  // commandString() then reads; kInvalidParameter when it is empty.
  VStatus doFinalize(const VString &command);
  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
