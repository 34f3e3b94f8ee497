// Base class of the commands that create plug-in UI controls.
//
// Run without the edit or query flag the command makes a control; with
// them, the flags of the command's syntax apply to an existing one.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxUIControl.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VSyntax.h>

OPENVORLA_NAMESPACE_OPEN

class VArgParser;

class OPENVORLA_EXPORT VPxControlCommand {
public:
  VPxControlCommand();
  virtual ~VPxControlCommand();

  // A new control, owned by the host.
  virtual VPxUIControl *makeControl() = 0;
  // kUnknownParameter by default: the command has no flags of its own.
  virtual VStatus doEditFlags();
  virtual VStatus doQueryFlags();
  // Adds the command's flags to syntax(); kSuccess by default.
  virtual VStatus appendSyntax();
  // Whether the flag is left for doEditFlags when the control is made, rather
  // than applied by the host; false by default.
  virtual bool skipFlagForCreate(const VString &longFlag);

  // The syntax the command is parsed with: edit and query enabled, no flags.
  VSyntax &syntax();
  // The parser of the command line being run, from which doEditFlags and
  // doQueryFlags read their flags; null outside them.
  VArgParser *parser();
  // The result of the command, as VPxCommand's result functions set it.
  void clearResult();
  void setResult(bool result);
  void setResult(int result);
  void setResult(double result);
  void setResult(const VString &result);
  void appendToResult(int result);
  void appendToResult(double result);
  void appendToResult(const VString &result);
  static const char *className();

private:
  VSyntax fSyntax;
};

OPENVORLA_NAMESPACE_CLOSE
