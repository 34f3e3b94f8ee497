// Base class of plug-in commands.
//
// The result of a command is the application's: the result functions are
// static and act on the result of the command that runs.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VArgList.h>
#include <openvorla/VDoubleArray.h>
#include <openvorla/VIntArray.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VStringArray.h>
#include <openvorla/VSyntax.h>

#include <cstddef>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxCommand {
public:
  enum VResultType {
    kLong,
    kDouble,
    kString,
    kNoArg
  };

  VPxCommand();
  virtual ~VPxCommand();

  // The host's defaults do nothing and report kNotImplemented.
  virtual VStatus doIt(const VArgList &args);
  virtual VStatus redoIt();
  virtual VStatus undoIt();
  // What setUndoable() last set; false by default.
  virtual bool isUndoable() const;

  // Booleans are integer results 0 and 1.
  static void setResult(bool result);
  static void setResult(int result);
  static void setResult(unsigned int result);
  static void setResult(double result);
  static void setResult(const VString &result);
  static void setResult(const VIntArray &result);
  static void setResult(const VDoubleArray &result);
  static void setResult(const VStringArray &result);
  // Appending makes the result an array. A value of another kind than the
  // result's starts a new array with it.
  static void appendToResult(bool result);
  static void appendToResult(int result);
  static void appendToResult(double result);
  static void appendToResult(const VString &result);
  static void clearResult();

  // kNoArg when there is no result.
  static VResultType currentResultType();
  static bool isCurrentResultArray();
  // The result as a single value; kInvalidParameter (and 0 or "") for an array
  // or a result of another kind. An integer result is also a double result.
  static int currentIntResult(VStatus *ReturnStatus = NULL);
  static double currentDoubleResult(VStatus *ReturnStatus = NULL);
  static VString currentStringResult(VStatus *ReturnStatus = NULL);
  // The result as an array, a single value as one element; kInvalidParameter
  // for a result of another kind, and the array is left empty.
  static VStatus getCurrentResult(VIntArray &result);
  static VStatus getCurrentResult(VDoubleArray &result);
  static VStatus getCurrentResult(VStringArray &result);

  // Messages to the user, written to the application log.
  static void displayInfo(const VString &message);
  static void displayWarning(const VString &message);
  static void displayError(const VString &message);

  void setUndoable(bool undoable);
  // The command line that ran the command, as the host records it.
  VString commandString() const;
  void setCommandString(const VString &command);
  static const char *className();

protected:
  // True: the host checks the command's arguments against its syntax before
  // doIt().
  virtual bool hasSyntax() const;
  // The syntax the command was registered with.
  VSyntax syntax() const;
  // Whether the command is echoed to the history; false by default.
  VStatus setHistoryOn(bool historyOn);
  bool isHistoryOn(VStatus *ReturnStatus = NULL) const;

private:
  friend class VPxCommandAccess;
  bool fUndoable;
  bool fHistoryOn;
  VString fCommandString;
  VSyntax fSyntax;
};

OPENVORLA_NAMESPACE_CLOSE
