// TpythonLock: re-entrant, any-thread hold of the interpreter lock.
//
// A host thread that Python has never seen gets one thread state on its
// first lock and keeps it for its life: later locks only switch it in and
// out, as a long-running application does, instead of making and destroying
// a thread state each time. The thread state goes when the thread ends, or
// with the interpreter if that finalises first. Threads that have a thread
// state of their own (the main thread, threads Python started) keep using it
// through the interpreter's own re-entrant calls.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <scriptrunner/TpythonLock.h>

#include <atomic>

namespace {

std::atomic<int> gCaptures{0};

// Bumped when an interpreter finalises: thread states made before belong to
// it and are gone with it.
std::atomic<unsigned> gGeneration{0};
void noteFinalised() { ++gGeneration; }

enum State : int { kHeld = 0, kSwitchedIn = 1, kEnsured = 2 };

// The thread state this host thread made for itself, if any.
struct HostThread {
  PyThreadState *state = nullptr;
  unsigned generation = 0;

  bool current() const { return state && generation == gGeneration.load(); }

  ~HostThread() {
    if (!current() || !Py_IsInitialized()) return;
    PyEval_RestoreThread(state);
    PyGILState_Release(PyGILState_UNLOCKED);  // deletes it and lets the lock go
  }
};

thread_local HostThread tHost;

}  // namespace

// The counter moves only while the lock is held, so a reader holding the lock
// sees every capture that is really outstanding.
TpythonLock::TpythonLock() {
  if (tHost.current()) {
    if (PyGILState_Check()) {
      fState = kHeld;  // this thread holds it already
    } else {
      PyEval_RestoreThread(tHost.state);
      fState = kSwitchedIn;
    }
  } else if (!PyGILState_GetThisThreadState()) {
    // First use on a new host thread: the thread state it makes stays.
    static const bool registered = (Py_AtExit(noteFinalised), true);
    (void)registered;
    PyGILState_Ensure();  // undone when the thread ends
    tHost.state = PyThreadState_Get();
    tHost.generation = gGeneration.load();
    fState = kSwitchedIn;
  } else {
    fState = kEnsured + PyGILState_Ensure();
  }
  ++gCaptures;
}

TpythonLock::~TpythonLock() {
  --gCaptures;
  if (fState == kSwitchedIn)
    PyEval_SaveThread();
  else if (fState >= kEnsured)
    PyGILState_Release(static_cast<PyGILState_STATE>(fState - kEnsured));
}

int TpythonLock::captureCount() { return gCaptures.load(); }
