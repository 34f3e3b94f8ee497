// VPxContextCommand: the host's default context command.
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxContextCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxContextCommand::VPxContextCommand() {
  fSyntax.enableEdit();
  fSyntax.enableQuery();
  standin::noteConstructed("VPxContextCommand");
}

VPxContextCommand::~VPxContextCommand() { standin::noteDestroyed("VPxContextCommand"); }

VPxContext *VPxContextCommand::makeObj() { return nullptr; }
VStatus VPxContextCommand::doEditFlags() { return VStatus::kUnknownParameter; }
VStatus VPxContextCommand::doQueryFlags() { return VStatus::kUnknownParameter; }
VStatus VPxContextCommand::appendSyntax() { return VStatus::kSuccess; }
VSyntax &VPxContextCommand::syntax() { return fSyntax; }

// The stand-in never edits or queries a context, so there is no parser.
VArgParser *VPxContextCommand::parser() { return nullptr; }

VStatus VPxContextCommand::setResult(bool result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

VStatus VPxContextCommand::setResult(int result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

VStatus VPxContextCommand::setResult(double result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

VStatus VPxContextCommand::setResult(const VString &result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

const char *VPxContextCommand::className() { return "VPxContextCommand"; }

OPENVORLA_NAMESPACE_CLOSE
