// Conversion result codes to Python exception classes, and setting the error.

#include "errors.h"

#include "swigrt.h"

namespace swigrt {

PyObject *ErrorTypeFor(int code) {
  switch (code) {
    case SWIG_MemoryError:
      return PyExc_MemoryError;
    case SWIG_AttributeError:
      return PyExc_AttributeError;
    case SWIG_SystemError:
      return PyExc_SystemError;
    case SWIG_ValueError:
      return PyExc_ValueError;
    case SWIG_SyntaxError:
      return PyExc_SyntaxError;
    case SWIG_OverflowError:
      return PyExc_OverflowError;
    case SWIG_DivisionByZero:
      return PyExc_ZeroDivisionError;
    case SWIG_TypeError:
      return PyExc_TypeError;
    case SWIG_IndexError:
      return PyExc_IndexError;
    case SWIG_IOError:
      return PyExc_IOError;
    default:
      // The generic failure, the run-time failure and a refused null have
      // no class of their own.
      return PyExc_RuntimeError;
  }
}

void SetErrorMessage(PyObject *errtype, const char *message) { PyErr_SetString(errtype, message); }

}  // namespace swigrt

namespace swigrt {

void SetErrorFromException() noexcept {
  try {
    throw;
  } catch (const std::bad_alloc &) {
    PyErr_NoMemory();
  } catch (const std::length_error &e) {
    PyErr_SetString(PyExc_MemoryError, e.what());
  } catch (const std::exception &e) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_RuntimeError, e.what());
  } catch (...) {
    if (!PyErr_Occurred()) PyErr_SetString(PyExc_RuntimeError, "unknown C++ exception");
  }
}

}  // namespace swigrt
