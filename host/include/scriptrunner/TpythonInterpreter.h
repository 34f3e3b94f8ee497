// The application's embedded Python interpreter.
#pragma once

#include <basekit/Texport.h>

class T_EXPORT TpythonInterpreter {
public:
  static TpythonInterpreter &interpreter();

  // If a Python exception is pending, writes it with its traceback to the
  // application log as one entry whose first line says where it happened:
  // "Python exception in plug-in 'p', in Class.method, <what the host was
  // doing>:", each part left out when it is not known. Clears it and returns
  // true; otherwise returns false. Takes the interpreter lock itself, so any
  // thread may call it.
  bool catchAndReportException();

  TpythonInterpreter(const TpythonInterpreter &) = delete;
  TpythonInterpreter &operator=(const TpythonInterpreter &) = delete;

private:
  TpythonInterpreter() = default;
};
