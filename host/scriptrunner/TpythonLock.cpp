// TpythonLock: re-entrant, any-thread hold of the interpreter lock.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonLock.h>

#include <atomic>

namespace {
std::atomic<int> gCaptures{0};
}

// The counter moves only while the lock is held, so a reader holding the lock
// sees every capture that is really outstanding.
TpythonLock::TpythonLock() : fState(PyGILState_Ensure()) { ++gCaptures; }

TpythonLock::~TpythonLock() {
  --gCaptures;
  PyGILState_Release(static_cast<PyGILState_STATE>(fState));
}

int TpythonLock::captureCount() { return gCaptures.load(); }
