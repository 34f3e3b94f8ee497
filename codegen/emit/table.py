"""The method table and its twin searched by name."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from ..model import Module, METH_NOARGS, METH_O, METH_VARARGS

_FLAGS = {METH_VARARGS: 'METH_VARARGS', METH_NOARGS: 'METH_NOARGS', METH_O: 'METH_O'}


def _guarded(function: str) -> str:
    return function if function.startswith('swigrt::') else f'swigrt::Safe<{function}>'


def emit(module: Module) -> str:
    # Every generated or hand-written entry point runs inside swigrt::Safe.
    rows = ''.join(f'    {{{c_string(e.name)}, {_guarded(e.function)}, {_FLAGS[e.flags]}, nullptr}},\n'
                   for e in module.entries)
    end = '    {nullptr, nullptr, 0, nullptr},\n'
    return ''.join([
        banner(module, f'the method table ({len(module.entries)} entries)'),
        f'#include "{module.ident}_wrap.h"\n\n', namespace_open(module),
        '\nPyMethodDef module_methods[] = {\n', rows, end, '};\n\n',
        '// The same entries, searched by name when a class method is made.\n',
        'PyMethodDef proxydoc_methods[] = {\n', rows, end, '};\n\n',
        namespace_close(module)])
