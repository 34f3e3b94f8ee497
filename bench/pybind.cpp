// bench_pybind: the benchmark's host calls bound with pybind11, the way a
// plug-in author would bind them: classes with py::class_, host strings
// through type casters, a failed status raised as an exception.
#include <pybind11/pybind11.h>

#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxNode.h>

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

PYBIND11_MODULE(bench_pybind, m) {
  m.def("registeringCallableScript", &VFnPlugin::registeringCallableScript);

  py::class_<VPxNode>(m, "VPxNode")
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
}
