// bench_pybind: the benchmark's host calls bound with pybind11, the way a
// plug-in author would bind them: classes with py::class_, host strings
// through type casters, a failed status raised as an exception. VPxNode and
// VPxData have trampolines, so that Python subclasses override their
// virtuals for the host, and the host's side of those calls is timed here
// with the loops of host_loops.h.
#include <pybind11/pybind11.h>

#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxNode.h>
#include <scriptrunner/TpythonInterpreter.h>

#include "host_loops.h"

namespace py = pybind11;
using namespace OPENVORLA_NAMESPACE;

namespace pybind11::detail {

template <>
struct type_caster<VString> {
  PYBIND11_TYPE_CASTER(VString, const_name("str"));

  bool load(handle src, bool) {
    if (!PyUnicode_Check(src.ptr())) return false;
    Py_ssize_t size = 0;
    wchar_t *text = PyUnicode_AsWideCharString(src.ptr(), &size);
    if (!text) {
      PyErr_Clear();
      return false;
    }
    static_cast<Tstring &>(value).set(text, static_cast<size_t>(size));
    PyMem_Free(text);
    return true;
  }

  static handle cast(const VString &s, return_value_policy, handle) {
    return PyUnicode_FromWideChar(s.asWChar(), s.numChars());
  }
};

template <>
struct type_caster<VStringArray> {
  PYBIND11_TYPE_CASTER(VStringArray, const_name("list[str]"));

  bool load(handle, bool) { return false; }  // a result only

  static handle cast(const VStringArray &array, return_value_policy, handle) {
    py::list list(array.length());
    for (unsigned int i = 0; i < array.length(); ++i) {
      VString item = array[i];
      PyObject *text = PyUnicode_FromWideChar(item.asWChar(), item.numChars());
      if (!text) throw error_already_set();
      PyList_SET_ITEM(list.ptr(), i, text);
    }
    return list.release();
  }
};

}  // namespace pybind11::detail

namespace {

// A Python exception out of an override is reported through the host's
// engine and the host gets the default, as the forwarding overrides do.
void Report(py::error_already_set &error) {
  error.restore();
  TpythonInterpreter::interpreter().catchAndReportException();
}

// The trampolines: each override is what PYBIND11_OVERRIDE expands to (the
// lock, get_override, the call) with the forwarding overrides' result rules
// and failure handling. The host objects go in as pointers, which pybind11
// wraps by reference; a reference argument would be copied.
class PyNode : public VPxNode {
 public:
  VStatus compute(const VPlug &plug, VDataBlock &block) override {
    py::gil_scoped_acquire gil;
    try {
      py::function override = py::get_override(static_cast<const VPxNode *>(this), "compute");
      if (!override) return VPxNode::compute(plug, block);
      py::object result = override(&plug, &block);
      static PyObject *unknown = PyUnicode_InternFromString("unknown");
      PyObject *r = result.ptr();
      if ((PyUnicode_Check(r) || PyBytes_Check(r)) && r == unknown) return VStatus::kUnknownParameter;
      return VStatus::kSuccess;
    } catch (py::error_already_set &error) {
      Report(error);
      return VStatus::kFailure;
    }
  }

  bool isAbstractClass() const override {
    py::gil_scoped_acquire gil;
    try {
      py::function override = py::get_override(static_cast<const VPxNode *>(this), "isAbstractClass");
      if (!override) return VPxNode::isAbstractClass();
      return override().ptr() == Py_True;
    } catch (py::error_already_set &error) {
      Report(error);
      return false;
    }
  }
};

class PyData : public VPxData {
 public:
  VString name() const override {
    py::gil_scoped_acquire gil;
    try {
      py::function override = py::get_override(static_cast<const VPxData *>(this), "name");
      if (!override) py::pybind11_fail("pure virtual VPxData::name called");
      py::object result = override();
      py::detail::make_caster<VString> text;
      if (!text.load(result, false))
        PyErr_SetString(PyExc_TypeError, "Invalid Python object, expected a String or Unicode object");
      return py::detail::cast_op<VString &&>(std::move(text));
    } catch (py::error_already_set &error) {
      Report(error);
      return VString();
    }
  }

  void copy(const VPxData &source) override { PYBIND11_OVERRIDE_PURE(void, VPxData, copy, &source); }
  VTypeId typeId() const override { PYBIND11_OVERRIDE_PURE(VTypeId, VPxData, typeId, ); }
};

// The timing functions of bench_overrides, on pybind11's objects.
py::object Checked(PyObject *result) {
  if (!result) throw py::error_already_set();
  return py::reinterpret_steal<py::object>(result);
}

template <class T>
void Timed(py::module_ &m, const char *name, bench::Timing (*loop)(T *, long)) {
  m.def(name, [loop](T *object, long n) {
    if (n < 1) throw py::value_error("at least one call");
    return Checked(bench::Report(loop(object, n)));
  });
}

template <class T>
void Single(py::module_ &m, const char *name, PyObject *(*once)(T *)) {
  m.def(name, [once](T *object) { return Checked(once(object)); });
}

}  // namespace

PYBIND11_MODULE(bench_pybind, m) {
  m.def("registeringCallableScript", &VFnPlugin::registeringCallableScript);

  // Only passed to overrides.
  py::class_<VPlug>(m, "VPlug");
  py::class_<VDataBlock>(m, "VDataBlock");
  py::class_<VTypeId>(m, "VTypeId");

  py::class_<VPxNode, PyNode>(m, "VPxNode")
      .def(py::init<>())
      .def("isAbstractClass", &VPxNode::isAbstractClass)
      .def("getFilesToArchive", &VPxNode::getFilesToArchive, py::arg("shortName") = false,
           py::arg("unresolvedName") = false, py::arg("markCouldBeImageSequence") = false)
      .def("copyInternalData", &VPxNode::copyInternalData);

  py::class_<VPxCommand>(m, "VPxCommand")
      .def(py::init<>())
      .def("setCommandString", &VPxCommand::setCommandString);

  py::class_<VFnPlugin>(m, "VFnPlugin")
      // Attaches to a plug-in already loaded, found by name.
      .def(py::init([](const VString &name) {
        VObject object = VFnPlugin::findPlugin(name);
        return new VFnPlugin(object);
      }))
      .def("setVersion", [](VFnPlugin &plugin, const VString &version) -> py::object {
        VStatus status = plugin.setVersion(version);
        if (!status.error()) return py::none();
        if (status.statusCode() == VStatus::kUnknownParameter) return py::str("unknown");
        throw std::runtime_error(status.errorString().asUTF8());
      });

  py::class_<VPxData, PyData>(m, "VPxData").def(py::init<>());

  Timed<VPxNode>(m, "compute", bench::Compute);
  Timed<VPxNode>(m, "compute_in_thread", bench::ComputeInThread);
  Timed<VPxNode>(m, "isAbstractClass", bench::IsAbstractClass);
  Timed<VPxData>(m, "name", bench::Name);
  Single<VPxNode>(m, "compute_once", bench::ComputeOnce);
  Single<VPxNode>(m, "isAbstractClass_once", bench::IsAbstractClassOnce);
  Single<VPxData>(m, "name_once", bench::NameOnce);
}
