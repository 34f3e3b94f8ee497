"""Getters and setters of the static variables reached through `cvar`."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from ..model import GlobalVariable, Module


def getter(v: GlobalVariable) -> str:
    return f'get_{v.name}'


def setter(v: GlobalVariable) -> str:
    return f'set_{v.name}'


def _entry_points(v: GlobalVariable) -> str:
    if v.readonly:
        return ''
    return (f'PyObject *wrap_{v.name}_get(PyObject *, PyObject *args) {{\n'
            '  PyObject *argv[1];\n'
            f'  if (!swigrt::UnpackTuple(args, {c_string(v.name + "_get")}, 0, 0, argv)) return nullptr;\n'
            f'  return {getter(v)}();\n}}\n'
            f'PyObject *wrap_{v.name}_set(PyObject *, PyObject *arg) {{\n'
            f'  if (!arg || {setter(v)}(arg)) return nullptr;\n'
            '  Py_RETURN_NONE;\n}\n\n')


def _pair(v: GlobalVariable) -> str:
    # The wrapper points at the host's static itself and never owns it.
    address = f'const_cast<{v.spelling} *>(&{v.cpp})' if v.readonly else f'&{v.cpp}'
    out = [f'PyObject *{getter(v)}() {{\n'
           f'  return swigrt::NewPointerObj(nullptr, {address}, {v.descriptor.macro}, 0);\n}}\n']
    if v.readonly:
        out.append(f'int {setter(v)}(PyObject *) {{\n'
                   f'  return swigrt::RefuseVariable({c_string(v.message)});\n}}\n\n')
    else:
        out.append(f'int {setter(v)}(PyObject *value) {{\n'
                   f'  return swigrt::AssignVariable(value, {v.cpp}, {v.descriptor.macro},\n'
                   f'                                {c_string(v.message)},\n'
                   f'                                {c_string(v.null_message)});\n}}\n\n')
    return ''.join(out)


def emit(module: Module) -> str:
    out = [banner(module, f'the {len(module.variables)} static variables of cvar'),
           f'#include "{module.ident}_wrap.h"\n\n', namespace_open(module), '\n']
    out += [_pair(v) + _entry_points(v) for v in module.variables]
    out.append(namespace_close(module))
    return ''.join(out)
