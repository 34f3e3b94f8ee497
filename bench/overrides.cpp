// bench_overrides: the host calling virtual operations that Python overrides.
//
// The timing functions take a Python object whose C++ object the host would
// call: the instance of a Python subclass of a proxy class (the generated
// director is behind it) or the wrapper of one of the hand-written
// forwarders below. Either way the pointer is converted once and the same
// loop of host calls is timed in C++ (host_loops.h).
//
// The hand-written forwarders are the floor: C++ subclasses of the host
// classes that do what a forwarding override must, as directly as the C API
// allows. Per call: a TpythonLock, the arguments wrapped without ownership,
// the method name made into a new str, the method called by name on the
// Python instance, a Python error reported through the host's engine, the
// result converted, every reference released.
#include <openvorla/VPxData.h>
#include <openvorla/VPxNode.h>
#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>
#include <scriptrunner/TpythonObjectWithLock.h>

#include <type_traits>

#include "host_loops.h"
#include "swigrt.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

swig_type_info *node_type = nullptr;
swig_type_info *data_type = nullptr;
swig_type_info *plug_type = nullptr;
swig_type_info *block_type = nullptr;
PyObject *unknown = nullptr;  // the interned "unknown" that means kUnknownParameter

// Reports and clears a Python error that the call left; true if there was one.
bool Failed() {
  if (!PyErr_Occurred()) return false;
  TpythonInterpreter::interpreter().catchAndReportException();
  return true;
}

// Holds a strong reference to the Python instance it forwards to.
class Target {
 public:
  explicit Target(PyObject *self) : self_(Py_NewRef(self)) {}
  ~Target() {
    TpythonLock lock;
    Py_DECREF(self_);
  }
  Target(const Target &) = delete;
  Target &operator=(const Target &) = delete;

 protected:
  // args[0] must be free for the instance; the rest are the arguments.
  PyObject *Call(const char *name, PyObject **args, size_t nargs) const {
    PyObject *method = PyUnicode_FromString(name);
    if (!method) return nullptr;
    args[0] = self_;
    PyObject *result =
        PyObject_VectorcallMethod(method, args, (nargs + 1) | PY_VECTORCALL_ARGUMENTS_OFFSET, nullptr);
    Py_DECREF(method);
    return result;
  }

 private:
  PyObject *self_;
};

class FloorNode : public VPxNode, private Target {
 public:
  using Target::Target;

  VStatus compute(const VPlug &plug, VDataBlock &block) override {
    TpythonLock lock;
    PyObject *args[3] = {nullptr, swigrt::NewPointerObj(nullptr, const_cast<VPlug *>(&plug), plug_type, 0),
                         swigrt::NewPointerObj(nullptr, &block, block_type, 0)};
    PyObject *result = args[1] && args[2] ? Call("compute", args, 2) : nullptr;
    if (Failed()) Py_CLEAR(result);
    VStatus::VStatusCode code = !result ? VStatus::kFailure
                                : (PyUnicode_Check(result) || PyBytes_Check(result)) && result == unknown
                                    ? VStatus::kUnknownParameter
                                    : VStatus::kSuccess;
    Py_XDECREF(result);
    Py_XDECREF(args[2]);
    Py_XDECREF(args[1]);
    return code;
  }

  bool isAbstractClass() const override {
    TpythonLock lock;
    PyObject *args[1];
    PyObject *result = Call("isAbstractClass", args, 0);
    bool value = !Failed() && result == Py_True;
    Py_XDECREF(result);
    return value;
  }
};

class FloorData : public VPxData, private Target {
 public:
  using Target::Target;

  // Through the host's engine, as the forwarding overrides must convert text.
  VString name() const override {
    TpythonLock lock;
    PyObject *args[1];
    PyObject *result = Call("name", args, 0);
    if (Failed()) Py_CLEAR(result);
    VString text;
    {
      TpythonObjectWithLock value(result);
      if (!value.getValue(static_cast<Tstring &>(text)))
        PyErr_SetString(PyExc_TypeError, "Invalid Python object, expected a String or Unicode object");
    }
    Py_XDECREF(result);
    return text;
  }

  // Not timed; the host class wants them.
  void copy(const VPxData &) override {}
  VTypeId typeId() const override { return VTypeId(0x7f000); }
};

// --- to Python -------------------------------------------------------------------

// floor_node(instance), floor_data(instance) -> a wrapper that owns a new
// forwarder to `instance`.
PyObject *floor_node(PyObject *, PyObject *target) {
  return swigrt::NewPointerObj(nullptr, static_cast<VPxNode *>(new FloorNode(target)), node_type,
                               SWIG_POINTER_OWN);
}

PyObject *floor_data(PyObject *, PyObject *target) {
  return swigrt::NewPointerObj(nullptr, static_cast<VPxData *>(new FloorData(target)), data_type,
                               SWIG_POINTER_OWN);
}

template <class T>
T *Host(PyObject *obj, swig_type_info *ty) {
  void *ptr = nullptr;
  if (!SWIG_IsOK(swigrt::ConvertPtr(obj, &ptr, ty, 0)) || !ptr) {
    PyErr_Format(PyExc_TypeError, "expected a %s", ty->str);
    return nullptr;
  }
  return static_cast<T *>(ptr);
}

// (object, number of calls) -> ns per call, with object's C++ object of type T.
template <class T, bench::Timing (*loop)(T *, long)>
PyObject *Timed(PyObject *, PyObject *args) {
  PyObject *obj = nullptr;
  long n = 0;
  if (!PyArg_ParseTuple(args, "Ol", &obj, &n)) return nullptr;
  T *object = Host<T>(obj, std::is_same_v<T, VPxNode> ? node_type : data_type);
  if (!object) return nullptr;
  if (n < 1) {
    PyErr_SetString(PyExc_ValueError, "at least one call");
    return nullptr;
  }
  return bench::Report(loop(object, n));
}

// (object) -> the result of one host call.
template <class T, PyObject *(*once)(T *)>
PyObject *Single(PyObject *, PyObject *arg) {
  T *object = Host<T>(arg, std::is_same_v<T, VPxNode> ? node_type : data_type);
  return object ? once(object) : nullptr;
}

#define TIMED(name, T, loop) {name, Timed<T, loop>, METH_VARARGS, nullptr}
#define SINGLE(name, T, once) {name, Single<T, once>, METH_O, nullptr}

PyMethodDef methods[] = {
    {"floor_node", floor_node, METH_O, nullptr},
    {"floor_data", floor_data, METH_O, nullptr},
    TIMED("compute", VPxNode, bench::Compute),
    TIMED("compute_in_thread", VPxNode, bench::ComputeInThread),
    TIMED("isAbstractClass", VPxNode, bench::IsAbstractClass),
    TIMED("name", VPxData, bench::Name),
    SINGLE("compute_once", VPxNode, bench::ComputeOnce),
    SINGLE("isAbstractClass_once", VPxNode, bench::IsAbstractClassOnce),
    SINGLE("name_once", VPxData, bench::NameOnce),
    {nullptr, nullptr, 0, nullptr}};

PyModuleDef module = {PyModuleDef_HEAD_INIT, "bench_overrides", nullptr, -1, methods,
                      nullptr, nullptr, nullptr, nullptr};

}  // namespace

// The descriptors come from the shared table, which _OpenVorlaVPx fills.
PyMODINIT_FUNC PyInit_bench_overrides() {
  PyObject *ext = PyImport_ImportModule("openvorla._OpenVorlaVPx");
  if (!ext) return nullptr;
  Py_DECREF(ext);
  const char *names[] = {"_p_VPxNode", "_p_VPxData", "_p_VPlug", "_p_VDataBlock"};
  swig_type_info **slots[] = {&node_type, &data_type, &plug_type, &block_type};
  for (int i = 0; i < 4; ++i) {
    if (!(*slots[i] = swigrt::TypeQuery(names[i]))) {
      PyErr_Format(PyExc_LookupError, "no type descriptor %s", names[i]);
      return nullptr;
    }
  }
  if (!unknown && !(unknown = PyUnicode_InternFromString("unknown"))) return nullptr;
  return PyModule_Create(&module);
}
