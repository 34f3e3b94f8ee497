"""The method table and its twin searched by name."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from ..model import Module, MethodEntry, METH_FASTCALL, METH_NOARGS, METH_O, METH_VARARGS

_FLAGS = {METH_VARARGS: 'METH_VARARGS', METH_NOARGS: 'METH_NOARGS', METH_O: 'METH_O',
          METH_FASTCALL: 'METH_FASTCALL'}


def _function(e: MethodEntry) -> str:
    if e.flags == METH_FASTCALL:   # generated, and stored as every entry is
        return f'swigrt::FastEntry({e.function})'
    if e.catches or e.function.startswith('swigrt::'):
        return e.function
    return f'swigrt::Safe<{e.function}>'


def emit(module: Module) -> str:
    # No C++ exception leaves an entry: generated ones catch it, the table
    # wraps the others in swigrt::Safe.
    rows = ''.join(f'    {{{c_string(e.name)}, {_function(e)}, {_FLAGS[e.flags]}, nullptr}},\n'
                   for e in module.entries)
    end = '    {nullptr, nullptr, 0, nullptr},\n'
    return ''.join([
        banner(module, f'the method table ({len(module.entries)} entries)'),
        f'#include "{module.ident}_wrap.h"\n\n', namespace_open(module),
        '\nPyMethodDef module_methods[] = {\n', rows, end, '};\n\n',
        '// The same entries, searched by name when a class method is made.\n',
        'PyMethodDef proxydoc_methods[] = {\n', rows, end, '};\n\n',
        namespace_close(module)])
