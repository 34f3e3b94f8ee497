"""The private header shared by a module's generated sources."""
from __future__ import annotations

from .common import banner, namespace_close, namespace_open
from . import directors, protocols, variables
from ..model import METH_FASTCALL, Module


def emit(module: Module) -> str:
    out = [banner(module, 'declarations shared by the generated sources'), '#pragma once\n\n',
           '#include <map>\n#include <string>\n\n'
           '#include "swigrt.h"\n#include "errors.h"\n#include "args.h"\n#include "dispatch.h"\n'
           '#include "scalars.h"\n#include "text.h"\n'
           + ('#include "numbers.h"\n' if module.strict_scalars else '')
           + ('#include "sequences.h"\n#include "values.h"\n\n#include <limits>\n'
              if module.value_protocols else '')
           + ('#include <scriptrunner/TstringId.h>\n' if module.resources else '')
           + ('#include "director.h"\n#include "forward.h"\n' if module.directors else '') + '\n']
    out += [f'#include <{h}>\n' for h in module.headers]
    if module.namespace:
        out.append(f'\nusing namespace {module.namespace};\n')
    out.append('\n' + namespace_open(module))
    out.append(f'\nextern swig_type_info *swig_types[{len(module.descriptors) + 1}];\n'
               'extern swig_module_info swig_module;\n'
               'extern PyMethodDef module_methods[];\nextern PyMethodDef proxydoc_methods[];\n\n')
    out += [f'#define {d.macro} swig_types[{d.index}]\n' for d in module.descriptors]
    out.append('\n')
    for e in module.entries:
        if e.flags == METH_FASTCALL:
            out.append(f'PyObject *{e.function}(PyObject *self, PyObject *const *args, '
                       'Py_ssize_t nargs);\n')
        elif not e.function.startswith('swigrt::'):
            out.append(f'PyObject *{e.function}(PyObject *self, PyObject *args);\n')
    shared = ''.join(protocols.declarations(c) for c in module.classes)
    if shared:
        out.append('\n// Sequences read into values, and hashes of values, for every family.\n' + shared)
    if module.variables:
        out.append('\n')
    for v in module.variables:
        out.append(f'PyObject *{variables.getter(v)}();\nint {variables.setter(v)}(PyObject *value);\n')
    if module.directors:
        out.append('\n')
        out += [directors.declaration(d) for d in module.directors]
    out.append('\n' + namespace_close(module))
    return ''.join(out)
