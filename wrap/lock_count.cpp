// getLockCaptureCount: how many captures of the host's interpreter lock are
// outstanding, for plug-ins and tests that check the lock discipline.
#include <scriptrunner/TpythonLock.h>

#include "OpenVorlaVPx_wrap.h"

namespace OpenVorlaVPx_wrap {

PyObject *wrap_getLockCaptureCount(PyObject *, PyObject *) {
  return PyLong_FromLong(TpythonLock::captureCount());
}

}  // namespace OpenVorlaVPx_wrap
