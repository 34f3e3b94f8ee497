// The host's side of the override benchmark: loops of virtual calls that the
// host makes on a C++ object whose override lives in Python, timed in C++.
//
// bench_overrides (generated directors, hand-written forwarders) and
// bench_pybind (pybind11 trampolines) both build their timing functions from
// these templates, so every variant runs the very same loop; only the way the
// Python object becomes a C++ pointer differs, and that happens once, before
// the clock starts.
#pragma once

#ifndef PY_SSIZE_T_CLEAN
#define PY_SSIZE_T_CLEAN
#endif
#include <Python.h>

#include <openvorla/VPxData.h>
#include <openvorla/VPxNode.h>

#include <chrono>
#include <exception>
#include <string>
#include <thread>

namespace bench {

using OPENVORLA_NAMESPACE::VDataBlock;
using OPENVORLA_NAMESPACE::VPlug;
using OPENVORLA_NAMESPACE::VPxData;
using OPENVORLA_NAMESPACE::VPxNode;
using OPENVORLA_NAMESPACE::VStatus;
using OPENVORLA_NAMESPACE::VString;

struct Timing {
  double ns = 0;       // per call, the loop included
  long wrong = 0;      // calls that did not give the expected result
  std::string error;   // what a C++ exception out of a call said
};

// n calls of `call`, which says whether the result was the expected one. The
// count of wrong results keeps the results live, and is cheaper than a call
// by orders of magnitude.
template <class Call>
Timing Loop(long n, Call call) {
  Timing t;
  try {
    auto start = std::chrono::steady_clock::now();
    for (long i = 0; i < n; ++i) t.wrong += !call();
    std::chrono::duration<double, std::nano> spent = std::chrono::steady_clock::now() - start;
    t.ns = spent.count() / static_cast<double>(n);
  } catch (const std::exception &e) {
    t.error = e.what();
  }
  return t;
}

// A null plug and a default block, as the host hands them to compute().
inline Timing Compute(VPxNode *node, long n) {
  VPlug plug;
  VDataBlock block;
  return Loop(n, [&] { return !node->compute(plug, block).error(); });
}

inline Timing IsAbstractClass(VPxNode *node, long n) {
  return Loop(n, [&] { return node->isAbstractClass(); });
}

inline Timing Name(VPxData *data, long n) {
  return Loop(n, [&] { return data->name().numChars() == 3; });
}

// Compute() from a new thread that Python has never seen, as the host's
// evaluation threads call; this thread gives up the interpreter lock until
// it is done. Called with the lock held.
inline Timing ComputeInThread(VPxNode *node, long n) {
  Timing t;
  PyThreadState *state = PyEval_SaveThread();
  try {
    std::thread host([&] { t = Compute(node, n); });
    host.join();
  } catch (const std::exception &e) {  // no thread to be had
    t.error = e.what();
  }
  PyEval_RestoreThread(state);
  return t;
}

// ns per call to Python, or the error: a Python error left pending by the
// calls, a C++ exception, or wrong results.
inline PyObject *Report(const Timing &t) {
  if (PyErr_Occurred()) return nullptr;
  if (!t.error.empty()) {
    PyErr_SetString(PyExc_RuntimeError, t.error.c_str());
    return nullptr;
  }
  if (t.wrong) {
    PyErr_Format(PyExc_RuntimeError, "%ld calls gave a wrong result", t.wrong);
    return nullptr;
  }
  return PyFloat_FromDouble(t.ns);
}

// One call each, its result as a Python object, for the benchmark's checks.
template <class Call>
PyObject *Once(Call call) {
  try {
    PyObject *result = call();
    if (PyErr_Occurred()) Py_CLEAR(result);
    return result;
  } catch (const std::exception &e) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_RuntimeError, e.what());
    return nullptr;
  }
}

inline PyObject *ComputeOnce(VPxNode *node) {
  return Once([&] {
    VPlug plug;
    VDataBlock block;
    return PyLong_FromLong(node->compute(plug, block).statusCode());
  });
}

inline PyObject *IsAbstractClassOnce(VPxNode *node) {
  return Once([&] { return PyBool_FromLong(node->isAbstractClass()); });
}

inline PyObject *NameOnce(VPxData *data) {
  return Once([&] {
    VString text = data->name();
    return PyUnicode_FromWideChar(text.asWChar(), text.numChars());
  });
}

}  // namespace bench
