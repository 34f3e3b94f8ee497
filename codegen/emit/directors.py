"""Director classes: the C++ subclasses that forward the host's virtual calls
to Python overrides. Declarations go in the module's header, definitions in
one source per family."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from ..model import Companion, DirectorClass, Forward, ForwardArg, Module


def _params(f: Forward) -> str:
    return ', '.join(f'{a.cpp} {a.name}' for a in f.args)


def _signature(f: Forward, scope: str = '') -> str:
    const = ' const' if f.const else ''
    return f'{f.result.cpp} {scope}{f.name}({_params(f)}){const}'


def _companion_call(c: Companion) -> str:
    if c.pure:
        return f'swigrt::RaisePureVirtual({c_string(f"{c.owner}::{c.name}")});'
    call = f'{c.owner}::{c.name}({", ".join(name for _, name in c.params)})'
    return f'{call};' if c.result == 'void' else f'return {call};'


def declaration(d: DirectorClass) -> str:
    out = [f'class {d.name} : public {d.cls}, public Swig::Director {{\n public:\n']
    for params in d.constructors:
        extra = ''.join(f', {t} {n}' for t, n in params)
        out.append(f'  {"explicit " if not params else ""}{d.name}(PyObject *self{extra});\n')
    out.append(f'  ~{d.name}() override;\n\n')
    out += [f'  {_signature(f)} override;\n' for f in d.forwards]
    if d.companions:
        out.append('\n  // Protected members, reached from Python inside their own override.\n')
    for c in d.companions:
        const = ' const' if c.const else ''
        params = ', '.join(f'{t} {n}' for t, n in c.params)
        out.append(f'  {c.result} {c.name}SwigPublic({params}){const} {{ {_companion_call(c)} }}\n')
    out.append('\n  bool swig_get_inner(const char *name) const override {\n'
               '    auto it = swig_inner.find(name);\n'
               '    return it != swig_inner.end() && it->second;\n  }\n'
               '  void swig_set_inner(const char *name, bool value) const override {\n'
               '    swig_inner[name] = value;\n  }\n\n'
               ' private:\n  mutable std::map<std::string, bool> swig_inner;\n};\n\n')
    return ''.join(out)


def _wrap(a: ForwardArg) -> str:
    address = a.name if a.pointer else f'&{a.name}'
    return {
        'borrowed': lambda: f'swigrt::BorrowedArg({address}, {a.descriptor.macro})',
        'director': lambda: f'swigrt::DirectorArg({address}, {a.descriptor.macro})',
        'copied': lambda: f'swigrt::CopiedArg({a.name}, {a.descriptor.macro})',
        'string': lambda: f'swigrt::FromString({a.name})',
        'string_array': lambda: f'swigrt::FromStringArray({a.name})',
        'chars': lambda: f'swigrt::FromCharPtr({a.name})',
        'bool': lambda: f'PyBool_FromLong({a.name})',
        'long': lambda: f'PyLong_FromLong(static_cast<long>({a.name}))',
        'size_t': lambda: f'PyLong_FromSize_t({a.name})',
        'double': lambda: f'PyFloat_FromDouble({a.name})',
    }[a.kind]()


def _convert_result(f: Forward) -> str:
    r = f.result
    res = 'py_result.get()'
    return {
        'void': lambda: '',
        'status': lambda: f'  return swigrt::StatusResult({res});\n',
        'bool': lambda: f'  return swigrt::BoolResult({res});\n',
        'scalar': lambda: (f'  return static_cast<{r.cpp}>(swigrt::ScalarResult<{r.target}>('
                           f'{res}, swigrt::{r.converter}, {c_string(r.message)}));\n'),
        'value': lambda: (f'  return swigrt::ValueResult<{r.target}>({res}, {r.descriptor.macro}, '
                          f'{c_string(r.message)});\n'),
        'pointer': lambda: (f'  return swigrt::PointerResult<{r.target}>(this, {res}, '
                            f'{r.descriptor.macro}, {c_string(r.message)});\n'),
        'reference': lambda: (f'  return swigrt::ReferenceResult<{r.target}>(this, {res}, '
                              f'{r.descriptor.macro},\n      {c_string(r.message)}, '
                              f'{c_string(r.null_message)});\n'),
        'chars': lambda: f'  return swigrt::CharsResult(this, {res}, {c_string(r.message)});\n',
        'string': lambda: f'  return swigrt::StringResult({res});\n',
        'string_array': lambda: f'  return swigrt::StringArrayResult({res});\n',
    }[r.kind]()


def _forward(d: DirectorClass, f: Forward) -> str:
    out = [f'{_signature(f, d.name + "::")} {{\n  TpythonLock py_lock;\n'
           '  swigrt::CallScope py_scope;\n']
    if f.arity:
        names = ', '.join(a.name for a in f.args)
        fallback = (f'swigrt::RaisePureVirtual({c_string(f.qualified)})' if f.pure
                    else f'return {d.cls}::{f.name}({names})')
        out.append(f'  if (!swigrt::ArityAccepts(swig_get_self(), {c_string(f.name)}, '
                   f'{len(f.args)})) {fallback};\n')
    passed = [a for a in f.args if a.kind != 'status_out']
    for i, a in enumerate(passed):
        out.append(f'  swigrt::Ref py_arg{i}({_wrap(a)});\n')
    out.append(f'  if (!swig_get_self()) swigrt::RaiseUninitialized({c_string(d.uninitialized)});\n')
    if passed:
        out.append(f'  PyObject *py_args[] = {{{", ".join(f"py_arg{i}.get()" for i in range(len(passed)))}}};\n')
    call_args = f'py_args, {len(passed)}' if passed else 'nullptr, 0'
    protected = ', true' if f.protected else ''
    out.append(f'  swigrt::Ref py_result(swigrt::CallOverride(this, {c_string(f.name)}, '
               f'{call_args}{protected}));\n')
    for a in f.args:
        if a.kind == 'status_out':
            out.append(f'  if ({a.name}) *{a.name} = swigrt::StatusResult(py_result.get() ? '
                       'Py_None : nullptr);\n')
    out.append(_convert_result(f) + '}\n\n')
    return ''.join(out)


def _definitions(d: DirectorClass) -> str:
    out = [f'// {d.name}\n\n']
    for params in d.constructors:
        extra = ''.join(f', {t} {n}' for t, n in params)
        names = ', '.join(n for _, n in params)
        out.append(f'{d.name}::{d.name}(PyObject *self{extra})\n'
                   f'    : {d.cls}({names}), Swig::Director(self) {{\n'
                   '  TpythonLock lock;\n}\n\n')
    out.append(f'{d.name}::~{d.name}() {{\n  TpythonLock lock;\n'
               f'  swig_forget_object(static_cast<{d.cls} *>(this));\n}}\n\n')
    out += [_forward(d, f) for f in d.forwards]
    return ''.join(out)


def emit(module: Module, family: str) -> str:
    out = [banner(module, f'director classes of the {family} family'),
           f'#include "{module.ident}_wrap.h"\n\n', namespace_open(module), '\n']
    out += [_definitions(c.director_class) for c in module.families[family] if c.director_class]
    out.append(namespace_close(module))
    return ''.join(out)
