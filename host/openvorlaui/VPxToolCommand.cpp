// VPxToolCommand: the host's default tool command.
#include <openvorla/VPxToolCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxToolCommand::VPxToolCommand() { standin::noteConstructed("VPxToolCommand"); }
VPxToolCommand::~VPxToolCommand() { standin::noteDestroyed("VPxToolCommand"); }

VStatus VPxToolCommand::cancel() {
  return VStatus(VStatus::kNotImplemented, "The tool command cannot be cancelled");
}

VStatus VPxToolCommand::finalize() {
  return VStatus(VStatus::kNotImplemented, "The tool command records nothing");
}

VStatus VPxToolCommand::doFinalize(const VString &command) {
  if (command.numChars() == 0) return VStatus(VStatus::kInvalidParameter, "Empty command line");
  setCommandString(command);
  return VStatus::kSuccess;
}

const char *VPxToolCommand::className() { return "VPxToolCommand"; }

OPENVORLA_NAMESPACE_CLOSE
