// Scoped hold of the Python interpreter lock for the calling thread.
//
// Any thread may construct one, also a thread that Python has never seen, and
// a thread that already holds the lock may take it again: each TpythonLock
// restores on destruction exactly the state its constructor found.
#pragma once

#include <basekit/Texport.h>

class T_EXPORT TpythonLock {
public:
  TpythonLock();
  ~TpythonLock();
  TpythonLock(const TpythonLock &) = delete;
  TpythonLock &operator=(const TpythonLock &) = delete;

  // Number of TpythonLock objects alive in the process, across all threads.
  static int captureCount();

private:
  int fState;  // how the constructor found the lock, for the destructor to undo
};
