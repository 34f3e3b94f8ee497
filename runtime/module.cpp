// Module start-up helpers: method documentation fix-up, constant installation,
// and the two functions that turn module functions into class methods.

#include <cstdlib>
#include <cstring>

#include "swigrt.h"

namespace swigrt {
namespace {

constexpr char kPointerMarker[] = "swig_ptr: ";

// Searched by name only; see PyInstanceMethod_New.
PyMethodDef *proxydoc_methods = nullptr;

// The descriptor of a pointer constant. Its `ptype` is a slot of the
// module's `types` array, which is still empty before InitializeModule; the
// descriptor at the same index of `types_initial` is the same type.
swig_type_info *ConstantType(const swig_const_info *constant, swig_type_info **types,
                             swig_type_info **types_initial) {
  if (!constant->ptype) return nullptr;
  if (*constant->ptype) return *constant->ptype;
  if (!types || !types_initial || constant->ptype < types) return nullptr;
  return types_initial[constant->ptype - types];
}

// Replaces the text after the marker with the constant's pointer, packed
// as "_" and two lowercase hex digits per byte in memory order, followed by
// the mangled type name, so that ConvertFunctionPtr can read it back.
const char *DocWithPointer(const char *doc, const char *after_marker, void *pointer,
                           const char *type_name) {
  static const char digits[] = "0123456789abcdef";
  size_t prefix = static_cast<size_t>(after_marker - doc);
  size_t name_size = std::strlen(type_name) + 1;
  auto *text = static_cast<char *>(std::malloc(prefix + 1 + 2 * sizeof pointer + name_size));
  if (!text) return nullptr;
  std::memcpy(text, doc, prefix);
  char *out = text + prefix;
  *out++ = '_';
  unsigned char bytes[sizeof pointer];
  std::memcpy(bytes, &pointer, sizeof pointer);
  for (unsigned char byte : bytes) {
    *out++ = digits[byte >> 4];
    *out++ = digits[byte & 0xf];
  }
  std::memcpy(out, type_name, name_size);
  return text;
}

// The same-named entry of proxydoc_methods as a new built-in bound like
// `func`, or `func` itself; a new reference either way.
PyObject *WithProxyDoc(PyObject *func) {
  if (PyCFunction_Check(func)) {
    auto *cfunc = reinterpret_cast<PyCFunctionObject *>(func);
    const char *name = cfunc->m_ml->ml_name;
    for (PyMethodDef *def = proxydoc_methods; def && def->ml_meth; ++def) {
      if (std::strcmp(def->ml_name, name) == 0)
        return PyCMethod_New(def, cfunc->m_self, cfunc->m_module, nullptr);
    }
  }
  Py_INCREF(func);
  return func;
}

}  // namespace

void FixMethods(PyMethodDef *methods, const swig_const_info *const_table, swig_type_info **types,
                swig_type_info **types_initial) {
  for (PyMethodDef *method = methods; method && method->ml_name; ++method) {
    const char *doc = method->ml_doc;
    const char *marker = doc ? std::strstr(doc, kPointerMarker) : nullptr;
    if (!marker) continue;
    const char *const_name = marker + sizeof kPointerMarker - 1;
    const swig_const_info *constant = const_table;
    while (constant && constant->type && std::strcmp(constant->name, const_name) != 0) ++constant;
    if (!constant || !constant->type) continue;
    if (constant->type != SWIG_PY_POINTER || !constant->pvalue) continue;
    swig_type_info *ty = ConstantType(constant, types, types_initial);
    // The new text is never freed: the method table lives as long as the process.
    if (const char *text = DocWithPointer(doc, const_name, constant->pvalue, ty ? ty->name : ""))
      method->ml_doc = text;
  }
}

void InstallConstants(PyObject *dict, const swig_const_info *constants) {
  for (const swig_const_info *constant = constants; constant && constant->type; ++constant) {
    swig_type_info *ty = constant->ptype ? *constant->ptype : nullptr;
    PyObject *value = nullptr;
    switch (constant->type) {
      case SWIG_PY_POINTER:
        value = NewPointerObj(nullptr, constant->pvalue, ty, 0);
        break;
      case SWIG_PY_BINARY:
        if (constant->pvalue) {
          value = SwigPyPacked_New(constant->pvalue, static_cast<size_t>(constant->lvalue), ty);
        } else {
          Py_INCREF(Py_None);
          value = Py_None;
        }
        break;
      default:
        continue;
    }
    SetConstant(dict, constant->name, value);
  }
}

void SetConstant(PyObject *dict, const char *name, PyObject *value) {
  // A value that could not be made leaves its error pending and is skipped.
  if (!value) return;
  PyDict_SetItemString(dict, name, value);
  Py_DECREF(value);
}

void SetProxyDocMethods(PyMethodDef *methods) { proxydoc_methods = methods; }

PyObject *PyInstanceMethod_New(PyObject *, PyObject *func) {
  PyObject *target = WithProxyDoc(func);
  if (!target) return nullptr;
  PyObject *method = ::PyInstanceMethod_New(target);
  Py_DECREF(target);
  return method;
}

PyObject *PyStaticMethod_New(PyObject *, PyObject *func) {
  PyObject *target = WithProxyDoc(func);
  if (!target) return nullptr;
  PyObject *method = ::PyStaticMethod_New(target);
  Py_DECREF(target);
  return method;
}

}  // namespace swigrt
