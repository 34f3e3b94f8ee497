// VPxControlCommand: the host's default control command.
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxControlCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxControlCommand::VPxControlCommand() {
  fSyntax.enableEdit();
  fSyntax.enableQuery();
  standin::noteConstructed("VPxControlCommand");
}

VPxControlCommand::~VPxControlCommand() { standin::noteDestroyed("VPxControlCommand"); }

VStatus VPxControlCommand::doEditFlags() { return VStatus::kUnknownParameter; }
VStatus VPxControlCommand::doQueryFlags() { return VStatus::kUnknownParameter; }
VStatus VPxControlCommand::appendSyntax() { return VStatus::kSuccess; }
bool VPxControlCommand::skipFlagForCreate(const VString &) { return false; }
VSyntax &VPxControlCommand::syntax() { return fSyntax; }

// The stand-in never edits or queries a control, so there is no parser.
VArgParser *VPxControlCommand::parser() { return nullptr; }

void VPxControlCommand::clearResult() { VPxCommand::clearResult(); }
void VPxControlCommand::setResult(bool result) { VPxCommand::setResult(result); }
void VPxControlCommand::setResult(int result) { VPxCommand::setResult(result); }
void VPxControlCommand::setResult(double result) { VPxCommand::setResult(result); }
void VPxControlCommand::setResult(const VString &result) { VPxCommand::setResult(result); }
void VPxControlCommand::appendToResult(int result) { VPxCommand::appendToResult(result); }
void VPxControlCommand::appendToResult(double result) { VPxCommand::appendToResult(result); }
void VPxControlCommand::appendToResult(const VString &result) {
  VPxCommand::appendToResult(result);
}

const char *VPxControlCommand::className() { return "VPxControlCommand"; }

OPENVORLA_NAMESPACE_CLOSE
