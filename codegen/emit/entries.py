"""The entry points of one family of classes: construction, destruction,
hand-over to the host and class registration."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from ..model import (METH_NOARGS, METH_O, Arg, Candidate, Constructor, DispatchRule, Module,
                     REFUSE_PLAIN, WrappedClass)


def _convert(a: Arg) -> str:
    slot = f'argv[{a.number - 1}]'
    if a.kind == 'scalar':
        var = f'arg{a.number}'
        local = f'  {a.cpp} {var}' + (f' = {a.default};\n' if a.default else ';\n')
        call = f'swigrt::ScalarArg(swigrt::{a.converter}({slot}, &{var}), {c_string(a.message)})'
    else:
        var = f'argp{a.number}'
        local = f'  void *{var} = nullptr;\n'
        if a.reference:
            call = (f'swigrt::ReferenceArg({slot}, {a.descriptor.macro}, &{var}, '
                    f'{c_string(a.message)}, {c_string(a.null_message)})')
        else:
            call = (f'swigrt::PointerArg({slot}, {a.descriptor.macro}, 0, &{var}, '
                    f'{c_string(a.message)})')
    present = f'{slot} && ' if a.default else ''
    return f'{local}  if ({present}!{call}) return nullptr;\n'


def _value(a: Arg) -> str:
    if a.kind == 'scalar':
        return f'static_cast<{a.cast}>(arg{a.number})' if a.cast else f'arg{a.number}'
    if a.reference:
        return f'*static_cast<{a.cpp} *>(argp{a.number})'
    return f'static_cast<{a.cpp} *>(argp{a.number})'


def _construct(cls: WrappedClass, ctor: Constructor, cand: Candidate) -> str:
    if ctor.refuse_plain:
        return (f'  swigrt::SetErrorMessage(PyExc_RuntimeError, {c_string(REFUSE_PLAIN)});\n'
                '  return nullptr;\n')
    values = [_value(a) for a in cand.args]
    return (f'  {cls.name} *result = new {cls.name}({", ".join(values)});\n'
            f'  return swigrt::NewPointerObj(nullptr, result, {cls.descriptor.macro}, '
            'SWIG_POINTER_NEW);\n')


def _check(a: Arg) -> str:
    if a.kind == 'scalar':
        return f'SWIG_IsOK(swigrt::{a.converter}(argv[{a.number - 1}], nullptr))'
    flags = 'SWIG_POINTER_NO_NULL' if a.reference else '0'
    return f'SWIG_IsOK(swigrt::ConvertPtr(argv[{a.number - 1}], nullptr, {a.descriptor.macro}, {flags}))'


def _dispatch_branch(rule: DispatchRule) -> str:
    lo, hi = rule.counts
    cond = f'argc == {lo}' if lo == hi else f'argc >= {lo} && argc <= {hi}'
    lines = []
    for i, (cand, test) in enumerate(zip(rule.candidates, rule.tests)):
        call = f'result = {cand.function}(argc, argv);'
        keyword = 'else ' if i else ''
        if test is None:
            lines.append(f'    {keyword}{call}\n')
        else:
            lines.append(f'    {keyword}if ({_check(test)})\n      {call}\n')
    return f'if ({cond}) {{\n' + ''.join(lines) + '  }'


def _constructor(cls: WrappedClass, ctor: Constructor) -> str:
    def head(param: str) -> str:
        return f'PyObject *{ctor.function}(PyObject *, PyObject *{param}) {{\n'

    if ctor.flags == METH_O:
        return head('arg') + '  if (!arg) return nullptr;\n' + \
            _construct(cls, ctor, ctor.candidates[0]) + '}\n'
    if ctor.flags == METH_NOARGS:
        return head('') + _construct(cls, ctor, ctor.candidates[0]) + '}\n'
    if len(ctor.candidates) == 1:
        cand = ctor.candidates[0]
        return (head('args') + f'  PyObject *argv[{cand.max_args}] = {{}};\n'
                f'  if (!swigrt::UnpackTuple(args, {c_string(ctor.entry)}, {cand.min_args}, '
                f'{cand.max_args}, argv)) return nullptr;\n'
                + ''.join(_convert(a) for a in cand.args) + _construct(cls, ctor, cand) + '}\n')
    out = []
    for cand in ctor.candidates:
        if cand.min_args == cand.max_args:
            count = f'argc != {cand.min_args}'
        else:
            count = f'argc < {cand.min_args} || argc > {cand.max_args}'
        argv = 'PyObject **argv' if cand.args else '[[maybe_unused]] PyObject **argv'
        out.append(f'static PyObject *{cand.function}(Py_ssize_t argc, {argv}) {{\n'
                   f'  if ({count}) return nullptr;\n'
                   + ''.join(_convert(a) for a in cand.args) + _construct(cls, ctor, cand) + '}\n\n')
    branches = ' else '.join(_dispatch_branch(r) for r in ctor.dispatch)
    out.append(head('args') + f'  PyObject *argv[{ctor.max_args}] = {{}};\n'
               f'  Py_ssize_t argc = swigrt::UnpackTuple(args, {c_string(ctor.entry)}, 0, '
               f'{ctor.max_args}, argv) - 1;\n'
               '  PyObject *result = nullptr;\n'
               f'  {branches}\n'
               '  if (!swigrt::DispatchFailed(result)) return result;\n'
               f'  swigrt::RaiseOrModifyTypeError({c_string(ctor.message)});\n'
               '  return nullptr;\n}\n')
    return ''.join(out)


def _class(cls: WrappedClass) -> str:
    d = cls.descriptor.macro
    msg = c_string(f"in method '{cls.delete_entry}', argument 1 of type '{cls.name} *'")
    out = [f'// {cls.name}\n\n']
    if cls.constructor:
        out.append(_constructor(cls, cls.constructor) + '\n')
    out.append(f'PyObject *wrap_{cls.delete_entry}(PyObject *, PyObject *arg) {{\n'
               '  if (!arg) return nullptr;\n  void *argp1 = nullptr;\n'
               f'  if (!swigrt::PointerArg(arg, {d}, SWIG_POINTER_DISOWN, &argp1, {msg})) '
               'return nullptr;\n'
               f'  delete static_cast<{cls.name} *>(argp1);\n  Py_RETURN_NONE;\n}}\n\n')
    if cls.director:
        msg = c_string(f"in method 'disown_{cls.name}', argument 1 of type '{cls.name} *'")
        out.append(f'PyObject *wrap_disown_{cls.name}(PyObject *, PyObject *arg) {{\n'
                   '  if (!arg) return nullptr;\n  void *argp1 = nullptr;\n'
                   f'  if (!swigrt::PointerArg(arg, {d}, 0, &argp1, {msg})) return nullptr;\n'
                   '  Py_RETURN_NONE;\n}\n\n')
    out.append(f'PyObject *wrap_{cls.name}_swigregister(PyObject *, PyObject *args) {{\n'
               f'  return swigrt::RegisterClass(args, {d});\n}}\n\n')
    return ''.join(out)


def emit(module: Module, family: str) -> str:
    classes = module.families[family]
    out = [banner(module, f'entry points of the {family} family'),
           f'#include "{module.ident}_wrap.h"\n\n', namespace_open(module), '\n']
    out += [_class(c) for c in classes]
    out.append(namespace_close(module))
    return ''.join(out)
