// SwigPyPacked: a Python object that owns a copied block of bytes and its type.

#include <cstdlib>
#include <cstring>

#include "swigrt.h"

namespace swigrt {
namespace {

SwigPyPacked *AsPacked(PyObject *op) { return reinterpret_cast<SwigPyPacked *>(op); }

// Both printed forms use a fixed buffer; blocks that do not fit fall back to
// the mangled name alone rather than growing the text.
constexpr size_t kPackedTextSize = 1024;

// Writes "_" and two lowercase hex digits per byte, in memory order.
bool PackedText(const SwigPyPacked *packed, char (&buffer)[kPackedTextSize]) {
  if (2 * packed->size + 2 > kPackedTextSize) return false;
  static const char digits[] = "0123456789abcdef";
  const auto *bytes = static_cast<const unsigned char *>(packed->pack);
  char *out = buffer;
  *out++ = '_';
  for (size_t i = 0; i < packed->size; ++i) {
    *out++ = digits[bytes[i] >> 4];
    *out++ = digits[bytes[i] & 0xf];
  }
  *out = '\0';
  return true;
}

const char *MangledName(const SwigPyPacked *packed) { return packed->ty ? packed->ty->name : ""; }

PyObject *Repr(PyObject *self) {
  SwigPyPacked *packed = AsPacked(self);
  char text[kPackedTextSize];
  if (PackedText(packed, text))
    return PyUnicode_FromFormat("<Swig Packed at %s%s>", text, MangledName(packed));
  return PyUnicode_FromFormat("<Swig Packed %s>", MangledName(packed));
}

PyObject *Str(PyObject *self) {
  SwigPyPacked *packed = AsPacked(self);
  char text[kPackedTextSize];
  if (PackedText(packed, text)) return PyUnicode_FromFormat("%s%s", text, MangledName(packed));
  return PyUnicode_FromString(MangledName(packed));
}

void Dealloc(PyObject *self) {
  if (SwigPyPacked_Check(self)) std::free(AsPacked(self)->pack);
  PyObject_Free(self);
}

PyTypeObject *BuildPackedType() {
  static PyTypeObject type;  // zero-initialised: unnamed slots stay empty
  Py_SET_REFCNT(reinterpret_cast<PyObject *>(&type), 1);
  type.tp_name = "SwigPyPacked";
  type.tp_basicsize = sizeof(SwigPyPacked);
  type.tp_dealloc = Dealloc;
  type.tp_repr = Repr;
  type.tp_str = Str;
  type.tp_getattro = PyObject_GenericGetAttr;
  type.tp_flags = Py_TPFLAGS_DEFAULT;
  type.tp_doc = "Swig object carries a C/C++ instance pointer";
  if (PyType_Ready(&type) < 0) return nullptr;
  return &type;
}

}  // namespace

PyTypeObject *SwigPyPacked_type() {
  static PyTypeObject *const type = BuildPackedType();
  return type;
}

bool SwigPyPacked_Check(PyObject *op) {
  PyTypeObject *type = Py_TYPE(op);
  return type == SwigPyPacked_type() || std::strcmp(type->tp_name, "SwigPyPacked") == 0;
}

PyObject *SwigPyPacked_New(void *ptr, size_t size, swig_type_info *ty) {
  PyTypeObject *type = SwigPyPacked_type();
  if (!type) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_SystemError, "SwigPyPacked type is not ready");
    return nullptr;
  }
  SwigPyPacked *packed = PyObject_New(SwigPyPacked, type);
  if (!packed) return nullptr;
  packed->pack = nullptr;
  packed->ty = ty;
  packed->size = 0;
  // malloc(0) may legitimately return null; an empty block still needs a
  // distinct allocation to tell it from a failure. A failed copy is
  // reported by the null result alone.
  void *copy = std::malloc(size ? size : 1);
  if (!copy) {
    Py_DECREF(packed);
    return nullptr;
  }
  if (size) std::memcpy(copy, ptr, size);
  packed->pack = copy;
  packed->size = size;
  return reinterpret_cast<PyObject *>(packed);
}

}  // namespace swigrt
