// VPxModelEditorCommand: the host's default model editor command.
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxModelEditorCommand.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

VPxModelEditorCommand::VPxModelEditorCommand() {
  fSyntax.enableEdit();
  fSyntax.enableQuery();
  standin::noteConstructed("VPxModelEditorCommand");
}

VPxModelEditorCommand::~VPxModelEditorCommand() { standin::noteDestroyed("VPxModelEditorCommand"); }

VPx3dModelView *VPxModelEditorCommand::makeModelView(const VString &) { return nullptr; }
VStatus VPxModelEditorCommand::doEditFlags() { return VStatus::kUnknownParameter; }
VStatus VPxModelEditorCommand::doQueryFlags() { return VStatus::kUnknownParameter; }
VStatus VPxModelEditorCommand::appendSyntax() { return VStatus::kSuccess; }
bool VPxModelEditorCommand::skipFlagForCreate(const VString &) { return false; }
VString VPxModelEditorCommand::editorCommandName() const { return VString(); }
VString VPxModelEditorCommand::editorMenuScriptName() const { return VString(); }
VSyntax &VPxModelEditorCommand::syntax() { return fSyntax; }

// The stand-in never edits or queries an editor, so there is no parser.
VArgParser *VPxModelEditorCommand::parser() { return nullptr; }
VString VPxModelEditorCommand::editorName() const { return VString(); }

VStatus VPxModelEditorCommand::setResult(bool result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

VStatus VPxModelEditorCommand::setResult(int result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

VStatus VPxModelEditorCommand::setResult(double result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

VStatus VPxModelEditorCommand::setResult(const VString &result) {
  VPxCommand::setResult(result);
  return VStatus::kSuccess;
}

const char *VPxModelEditorCommand::className() { return "VPxModelEditorCommand"; }

OPENVORLA_NAMESPACE_CLOSE
