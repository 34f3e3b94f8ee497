// The test host calling the application's virtual operations on wrapped
// objects, as the application does: through C++ virtual dispatch, from the
// calling thread or from new host threads that do not hold the interpreter
// lock, recording what the host received.
#include "host_calls.h"

#include <basekit/Tlog.h>
#include <openvorla/VArgList.h>
#include <openvorla/VDGContext.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VPlug.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxGeometryFilter.h>
#include <openvorla/VPxIkSolverNode.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VPxSurfaceShape.h>
#include <openvorla/VPxContext.h>
#include <openvorla/VPxContextCommand.h>
#include <openvorla/VPxTransform.h>
#include <openvorla/VPxTransformationMatrix.h>
#include <openvorla/VVector.h>

#include <functional>
#include <map>
#include <stdexcept>
#include <string>
#include <thread>
#include <variant>
#include <vector>

#include "swigrt.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

// What the host received from one call.
struct Exception {
  std::string what;
};
using Received = std::variant<std::monostate, long long, double, bool, std::string,
                              std::vector<std::string>, Exception>;
using HostCall = std::function<Received()>;

struct BadArgument : std::runtime_error {
  using std::runtime_error::runtime_error;
};

template <class T>
T &Object(PyObject *obj, const char *type) {
  swig_type_info *ty = swigrt::TypeQuery(type);
  void *ptr = nullptr;
  if (!ty || !SWIG_IsOK(swigrt::ConvertPtr(obj, &ptr, ty, 0)) || !ptr)
    throw BadArgument(std::string("expected a wrapped ") + type);
  return *static_cast<T *>(ptr);
}

PyObject *Arg(PyObject *args, Py_ssize_t i) {
  if (i >= PyTuple_GET_SIZE(args)) throw BadArgument("too few arguments for the host call");
  return PyTuple_GET_ITEM(args, i);
}

Received Status(const VStatus &s) { return static_cast<long long>(s.statusCode()); }
Received Text(const VString &s) { return std::string(s.asUTF8()); }
Received Texts(const VStringArray &a) {
  std::vector<std::string> out;
  for (unsigned int i = 0; i < a.length(); ++i) out.push_back(a[i].asUTF8());
  return out;
}

// Each operation converts its arguments while the caller holds the interpreter
// lock and returns the call the host then makes, perhaps from other threads.
using Binder = std::function<HostCall(PyObject *self, PyObject *args)>;

const std::map<std::string, Binder> &Operations() {
  static const std::map<std::string, Binder> ops = {
      {"VPxNode::compute",
       [](PyObject *self, PyObject *args) -> HostCall {
         auto &node = Object<VPxNode>(self, "_p_VPxNode");
         auto &plug = Object<VPlug>(Arg(args, 0), "_p_VPlug");
         auto &block = Object<VDataBlock>(Arg(args, 1), "_p_VDataBlock");
         return [&] { return Status(node.compute(plug, block)); };
       }},
      {"VPxNode::isAbstractClass",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &node = Object<VPxNode>(self, "_p_VPxNode");
         return [&] { return Received(node.isAbstractClass()); };
       }},
      {"VPxNode::internalArrayCount",
       [](PyObject *self, PyObject *args) -> HostCall {
         auto &node = Object<VPxNode>(self, "_p_VPxNode");
         auto &plug = Object<VPlug>(Arg(args, 0), "_p_VPlug");
         if (PyTuple_GET_SIZE(args) < 2)
           return [&] { return Received(static_cast<long long>(node.internalArrayCount(plug))); };
         auto &context = Object<VDGContext>(Arg(args, 1), "_p_VDGContext");
         return [&] {
           return Received(static_cast<long long>(node.internalArrayCount(plug, context)));
         };
       }},
      {"VPxNode::schedulingType",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &node = Object<VPxNode>(self, "_p_VPxNode");
         return [&] { return Received(static_cast<long long>(node.schedulingType())); };
       }},
      {"VPxNode::getFilesToArchive",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &node = Object<VPxNode>(self, "_p_VPxNode");
         return [&] { return Texts(node.getFilesToArchive()); };
       }},
      {"VPxIkSolverNode::solverTypeName",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &solver = Object<VPxIkSolverNode>(self, "_p_VPxIkSolverNode");
         return [&] { return Text(solver.solverTypeName()); };
       }},
      {"VPxGeometryFilter::getDeformationDetails",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &filter = Object<VPxGeometryFilter>(self, "_p_VPxGeometryFilter");
         return [&] { return Received(static_cast<long long>(filter.getDeformationDetails())); };
       }},
      {"VPxSurfaceShape::validateAndSetValue",
       [](PyObject *self, PyObject *args) -> HostCall {
         auto &shape = Object<VPxSurfaceShape>(self, "_p_VPxSurfaceShape");
         auto &plug = Object<VPlug>(Arg(args, 0), "_p_VPlug");
         auto &handle = Object<VDataHandle>(Arg(args, 1), "_p_VDataHandle");
         if (PyTuple_GET_SIZE(args) < 3)
           return [&] { return Received(shape.validateAndSetValue(plug, handle)); };
         auto &context = Object<VDGContext>(Arg(args, 2), "_p_VDGContext");
         return [&] { return Received(shape.validateAndSetValue(plug, handle, context)); };
       }},
      {"VPxCommand::doIt",
       [](PyObject *self, PyObject *args) -> HostCall {
         auto &cmd = Object<VPxCommand>(self, "_p_VPxCommand");
         VArgList list;
         for (Py_ssize_t i = 0; i < PyTuple_GET_SIZE(args); ++i) {
           const char *text = PyUnicode_AsUTF8(Arg(args, i));
           if (!text) throw BadArgument("doIt takes strings");
           list.addArg(VString(text));
         }
         return [&cmd, list] { return Status(cmd.doIt(list)); };
       }},
      {"VPxCommand::isUndoable",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &cmd = Object<VPxCommand>(self, "_p_VPxCommand");
         return [&] { return Received(cmd.isUndoable()); };
       }},
      {"VPxData::name",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &data = Object<VPxData>(self, "_p_VPxData");
         return [&] { return Text(data.name()); };
       }},
      {"VPxData::typeId",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &data = Object<VPxData>(self, "_p_VPxData");
         return [&] { return Received(static_cast<long long>(data.typeId().id())); };
       }},
      {"VPxData::copy",
       [](PyObject *self, PyObject *args) -> HostCall {
         auto &data = Object<VPxData>(self, "_p_VPxData");
         auto &source = Object<VPxData>(Arg(args, 0), "_p_VPxData");
         return [&] {
           data.copy(source);
           return Received();
         };
       }},
      {"VPxTransform::checkAndSetTranslation",
       [](PyObject *self, PyObject *args) -> HostCall {
         auto &transform = Object<VPxTransform>(self, "_p_VPxTransform");
         auto &block = Object<VDataBlock>(Arg(args, 0), "_p_VDataBlock");
         auto &plug = Object<VPlug>(Arg(args, 1), "_p_VPlug");
         auto &value = Object<VVector>(Arg(args, 2), "_p_VVector");
         return [&] {
           return Status(transform.checkAndSetTranslation(block, plug, value, VSpace::kTransform));
         };
       }},
      {"VPxContextCommand::makeObj",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &command = Object<VPxContextCommand>(self, "_p_VPxContextCommand");
         // The host keeps the context it is handed; the test deletes it later.
         return [&] { return Received(reinterpret_cast<long long>(command.makeObj())); };
       }},
      {"VPxTransformationMatrix::getTranslation",
       [](PyObject *self, PyObject *) -> HostCall {
         auto &matrix = Object<VPxTransformationMatrix>(self, "_p_VPxTransformationMatrix");
         return [&] { return Received(matrix.getTranslation().x); };
       }},
  };
  return ops;
}

// Runs a host call, turning what the application would catch into a record.
Received Guarded(const HostCall &call) {
  try {
    return call();
  } catch (const std::exception &e) {
    return Exception{e.what()};
  }
}

PyObject *ToPython(const Received &r) {
  struct {
    PyObject *operator()(std::monostate) { Py_RETURN_NONE; }
    PyObject *operator()(long long v) { return PyLong_FromLongLong(v); }
    PyObject *operator()(double v) { return PyFloat_FromDouble(v); }
    PyObject *operator()(bool v) { return PyBool_FromLong(v); }
    PyObject *operator()(const std::string &v) { return PyUnicode_FromString(v.c_str()); }
    PyObject *operator()(const std::vector<std::string> &v) {
      PyObject *list = PyList_New(0);
      for (const auto &s : v) {
        PyObject *item = PyUnicode_FromString(s.c_str());
        PyList_Append(list, item);
        Py_DECREF(item);
      }
      return list;
    }
    PyObject *operator()(const Exception &e) { return Py_BuildValue("(ss)", "exception", e.what.c_str()); }
  } convert;
  return std::visit(convert, r);
}

HostCall Bind(PyObject *args, Py_ssize_t first, PyObject **rest) {
  PyObject *self = PyTuple_GET_ITEM(args, 0);
  const char *name = PyUnicode_AsUTF8(PyTuple_GET_ITEM(args, 1));
  if (!name) throw BadArgument("the operation is named by a string");
  auto it = Operations().find(name);
  if (it == Operations().end()) throw BadArgument(std::string("no host operation ") + name);
  *rest = PyTuple_GetSlice(args, first, PyTuple_GET_SIZE(args));
  if (!*rest) throw BadArgument("cannot slice the arguments");
  return it->second(self, *rest);
}

}  // namespace

// call(obj, "Class::operation", *args): the host calls the operation once on
// this thread. The result is what the host received; an exception thrown into
// the host comes back as ("exception", what). When the call left a Python
// error set, the result is ("pending", received, error).
PyObject *host_call(PyObject *, PyObject *args) {
  if (PyTuple_GET_SIZE(args) < 2)
    return PyErr_Format(PyExc_TypeError, "call(obj, operation, *args)");
  PyObject *rest = nullptr;
  try {
    HostCall call = Bind(args, 2, &rest);
    Received r = Guarded(call);
    Py_XDECREF(rest);
    if (!PyErr_Occurred()) return ToPython(r);
    // The call left a Python error set (a director exception does, and so does
    // a string result of the wrong kind): hand back what the host received
    // and the pending error, cleared.
    PyObject *type, *value, *traceback;
    PyErr_Fetch(&type, &value, &traceback);
    PyErr_NormalizeException(&type, &value, &traceback);
    PyObject *received = ToPython(r);
    PyObject *out = Py_BuildValue("(sOO)", "pending", received, value ? value : Py_None);
    Py_XDECREF(received);
    Py_XDECREF(type);
    Py_XDECREF(value);
    Py_XDECREF(traceback);
    return out;
  } catch (const BadArgument &e) {
    Py_XDECREF(rest);
    return PyErr_Format(PyExc_TypeError, "%s", e.what());
  }
}

// call_threads(obj, "Class::operation", threads, calls, *args): `threads` new
// host threads each make `calls` calls while this thread waits without the
// interpreter lock. Returns {result: count}.
PyObject *host_call_threads(PyObject *, PyObject *args) {
  if (PyTuple_GET_SIZE(args) < 4)
    return PyErr_Format(PyExc_TypeError, "call_threads(obj, operation, threads, calls, *args)");
  long threads = PyLong_AsLong(PyTuple_GET_ITEM(args, 2));
  long calls = PyLong_AsLong(PyTuple_GET_ITEM(args, 3));
  if (PyErr_Occurred()) return nullptr;
  PyObject *rest = nullptr;
  try {
    HostCall call = Bind(args, 4, &rest);
    std::vector<std::vector<Received>> results(threads);
    Py_BEGIN_ALLOW_THREADS
    std::vector<std::thread> workers;
    for (long t = 0; t < threads; ++t)
      workers.emplace_back([&, t] {
        results[t].reserve(calls);
        for (long i = 0; i < calls; ++i) results[t].push_back(Guarded(call));
      });
    for (auto &w : workers) w.join();
    Py_END_ALLOW_THREADS
    Py_XDECREF(rest);
    PyObject *counts = PyDict_New();
    for (const auto &per_thread : results)
      for (const auto &r : per_thread) {
        PyObject *key = ToPython(r);
        PyObject *seen = PyDict_GetItemWithError(counts, key);
        PyObject *n = PyLong_FromLong(seen ? PyLong_AsLong(seen) + 1 : 1);
        PyDict_SetItem(counts, key, n);
        Py_DECREF(n);
        Py_DECREF(key);
      }
    return counts;
  } catch (const BadArgument &e) {
    Py_XDECREF(rest);
    return PyErr_Format(PyExc_TypeError, "%s", e.what());
  }
}

// host_delete(obj, type): the host deletes an object it owns through its
// virtual destructor, without the interpreter lock, as a host thread would.
PyObject *host_delete(PyObject *, PyObject *args) {
  PyObject *obj;
  const char *type;
  if (!PyArg_ParseTuple(args, "Os", &obj, &type)) return nullptr;
  swig_type_info *ty = swigrt::TypeQuery(type);
  void *ptr = nullptr;
  if (!ty || !SWIG_IsOK(swigrt::ConvertPtr(obj, &ptr, ty, 0)) || !ptr)
    return PyErr_Format(PyExc_TypeError, "expected a wrapped %s", type);
  static const std::map<std::string, void (*)(void *)> deleters = {
      {"_p_VPxNode", [](void *p) { delete static_cast<VPxNode *>(p); }},
      {"_p_VPxCommand", [](void *p) { delete static_cast<VPxCommand *>(p); }},
      {"_p_VPxData", [](void *p) { delete static_cast<VPxData *>(p); }},
      {"_p_VPxTransformationMatrix",
       [](void *p) { delete static_cast<VPxTransformationMatrix *>(p); }},
      {"_p_VPxTransform", [](void *p) { delete static_cast<VPxTransform *>(p); }},
      {"_p_VPxContext", [](void *p) { delete static_cast<VPxContext *>(p); }},
      {"_p_VPxContextCommand", [](void *p) { delete static_cast<VPxContextCommand *>(p); }},
  };
  auto it = deleters.find(type);
  if (it == deleters.end()) return PyErr_Format(PyExc_TypeError, "the host cannot delete a %s", type);
  Py_BEGIN_ALLOW_THREADS
  it->second(ptr);
  Py_END_ALLOW_THREADS
  Py_RETURN_NONE;
}

// log_entries(): the application's log; clear_log() empties it.
PyObject *log_entries(PyObject *, PyObject *) {
  PyObject *out = PyList_New(0);
  for (const auto &entry : Tlog::entries()) {
    PyObject *item = PyUnicode_DecodeUTF8(entry.data(), entry.size(), "replace");
    PyList_Append(out, item);
    Py_DECREF(item);
  }
  return out;
}

PyObject *clear_log(PyObject *, PyObject *) {
  Tlog::clear();
  Py_RETURN_NONE;
}
