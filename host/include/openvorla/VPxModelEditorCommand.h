// Base class of the commands that create plug-in model editors.
//
// Run without the edit or query flag the command makes an editor around a
// view; with them, the flags of the command's syntax apply to an existing one.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPx3dModelView.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VSyntax.h>

OPENVORLA_NAMESPACE_OPEN

class VArgParser;

class OPENVORLA_EXPORT VPxModelEditorCommand {
public:
  VPxModelEditorCommand();
  virtual ~VPxModelEditorCommand();

  // A new view for the editor of that name, owned by the host; null by
  // default: the editor shows the host's own view.
  virtual VPx3dModelView *makeModelView(const VString &editorName);
  // kUnknownParameter by default: the command has no flags of its own.
  virtual VStatus doEditFlags();
  virtual VStatus doQueryFlags();
  // Adds the command's flags to syntax(); kSuccess by default.
  virtual VStatus appendSyntax();
  // Whether the flag is left for doEditFlags when the editor is made; false.
  virtual bool skipFlagForCreate(const VString &longFlag);
  // The names of the command and of its menu's script; "" by default.
  virtual VString editorCommandName() const;
  virtual VString editorMenuScriptName() const;

  // The syntax the command is parsed with: edit and query enabled, no flags.
  VSyntax &syntax();
  // The parser of the command line being run, from which doEditFlags and
  // doQueryFlags read their flags, and the name of the editor it edits or
  // queries; null and "" outside them.
  VArgParser *parser();
  VString editorName() const;
  static const char *className();

protected:
  // The result of the command, as VPxCommand::setResult sets it.
  VStatus setResult(bool result);
  VStatus setResult(int result);
  VStatus setResult(double result);
  VStatus setResult(const VString &result);

private:
  VSyntax fSyntax;
};

OPENVORLA_NAMESPACE_CLOSE
