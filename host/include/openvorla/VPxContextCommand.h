// Base class of the commands that create plug-in contexts.
//
// Run without the edit or query flag the command makes a context; with
// them, the flags of the command's syntax apply to an existing one.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxContext.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VSyntax.h>

OPENVORLA_NAMESPACE_OPEN

class VArgParser;

class OPENVORLA_EXPORT VPxContextCommand {
public:
  VPxContextCommand();
  virtual ~VPxContextCommand();

  // A new context, owned by the host; null by default: no context is made.
  virtual VPxContext *makeObj();
  // kUnknownParameter by default: the command has no flags of its own.
  virtual VStatus doEditFlags();
  virtual VStatus doQueryFlags();
  // Adds the command's flags to syntax(); kSuccess by default.
  virtual VStatus appendSyntax();

  // The syntax the command is parsed with: edit and query enabled, no flags.
  VSyntax &syntax();
  // The parser of the command line being run, from which doEditFlags and
  // doQueryFlags read their flags; null outside them.
  VArgParser *parser();
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
