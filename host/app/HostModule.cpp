// The extension module vorla._host: the application's scripting module, from
// the application's own library, for the package vorla to export.
#include "Application.h"

PyMODINIT_FUNC PyInit__host() { return vorla::initScriptingModule(); }
