"""Type stubs of a module: `<Proxy>.pyi` for the Python classes and
`<extension>.pyi` for the extension's flat built-ins, constants and cvar."""
from __future__ import annotations

from .common import banner
from ..model import EntryPoint, MethodEntry, Module, PointerClass, WrappedClass
from ..model.pytypes import PySignature, PyType

_TYPING = 'from typing import Any, Callable, ClassVar, Literal, overload\n'
# Protocols show iterators.
_TYPING_VALUES = 'from typing import Any, Callable, ClassVar, Iterator, Literal, overload\n'
_THISOWN = ('    this: _SwigPyObject\n'
            '    @property\n'
            '    def thisown(self) -> bool: ...\n'
            '    @thisown.setter\n'
            '    def thisown(self, value: bool) -> None: ...\n'
            '    def __repr__(self) -> str: ...\n')


def _typing(module: Module) -> str:
    return _TYPING_VALUES if module.value_protocols else _TYPING


def _docstring(text: str, indent: str) -> str:
    text = text.replace('\\', '\\\\').replace('"""', '\\"\\"\\"')
    lines = text.split('\n')
    body = '\n'.join([lines[0]] + [indent + line if line else '' for line in lines[1:]])
    if body.endswith('"'):   # it would run into the closing quotes
        body = body[:-1] + '\\"'
    return f'{indent}"""{body}"""\n'


def _params(sig: PySignature, home: str, first: list[str]) -> str:
    params = first + [f'{p.name}: {p.type.render(home, True)}' +
                      ('' if p.default is None else ' = ...') for p in sig.params]
    return ', '.join(params + ['/'] if params else [])


def _def(sig: PySignature, home: str, indent: str, first: list[str], name: str = '',
         doc: str = '', decorators: tuple = (), result: str = '') -> str:
    out = ''.join(f'{indent}@{d}\n' for d in decorators)
    head = (f'{indent}def {name or sig.name}({_params(sig, home, first)}) -> '
            f'{result or sig.result.render(home, True)}:')
    if not doc:
        return out + head + ' ...\n'
    return out + head + '\n' + _docstring(doc, indent + '    ')


def _member(m: EntryPoint, home: str) -> str:
    if not m.candidates and not m.forms:   # written by hand: its arguments are its own business
        return f'    def {m.member}(self, *args: Any) -> Any: ...\n'
    first = [] if m.static else ['self']
    static = ('staticmethod',) if m.static else ()
    if len(m.forms) == 1:
        return _def(m.forms[0], home, '    ', first, m.member, m.doc, static)
    # Every form is one overload; the documentation goes with the first.
    return ''.join(_def(form, home, '    ', first, m.member, m.doc if i == 0 else '',
                        ('overload',) + static) for i, form in enumerate(m.forms))


def _property(get: EntryPoint, set_: EntryPoint, home: str) -> str:
    t = get.candidates[0].python.result.render(home, True)
    v = set_.candidates[0].python.params[0].type.render(home, True)
    doc = ('\n' + _docstring(get.doc, '        ')) if get.doc else ' ...\n'
    return (f'    @property\n    def {get.field}(self) -> {t}:{doc}'
            f'    @{get.field}.setter\n    def {get.field}(self, value: {v}) -> None: ...\n')


def _class(c: WrappedClass, home: str) -> str:
    base = f'({c.python_base})' if c.python_base else ''
    out = [f'\nclass {c.name}{base}:\n']
    if c.doc:
        out.append(_docstring(c.doc, '    '))
    out.append(_THISOWN)
    if c.constructor:
        forms = c.constructor.forms
        overloads = ('overload',) if len(forms) > 1 else ()
        out += [_def(form, home, '    ', ['self'], '__init__', decorators=overloads,
                     result='None') for form in forms]
    else:
        out.append('    def __init__(self, *args: Any, **kwargs: Any) -> None: ...\n')
    out.append('    @staticmethod\n'
               '    def __swig_destroy__(obj: Any, /) -> None: ...\n')
    if c.director:
        out.append('    def __disown__(self) -> Any: ...\n')
    setters = {m.field: m for m in c.members if m.accessor == 'set'}
    for m in c.members:
        if m.accessor == 'get':
            out.append(_property(m, setters[m.field], home))
        elif not m.accessor and m.protocol != 'repr':   # every class has its __repr__
            out.append(_member(m, home))
    out += [f'    {k.name[len(c.name) + 1:]}: {type(k.value).__name__}\n' for k in c.constants]
    out += [f'    {v.name[len(c.name) + 1:]}: ClassVar[{v.python.render(home, True)}]\n'
            for v in c.variables]
    return ''.join(out)


def _pointer_class(p: PointerClass, home: str) -> str:
    out = [f'\nclass {p.name}:\n', _THISOWN, '    def __init__(self) -> None: ...\n',
           '    @staticmethod\n'
           '    def __swig_destroy__(obj: Any, /) -> None: ...\n']
    out += [_def(sig, home, '    ', [] if static else ['self'],
                 decorators=('staticmethod',) if static else ()) for sig, static in p.python]
    return ''.join(out)


def _imports(module: Module, types: list[PyType], extension: bool) -> str:
    """The sibling modules the stub names: the classes' own module and those
    its types mention; the proxy module also imports those it derives from."""
    used = set().union(*(t.modules for t in types)) if types else set()
    used.discard('')
    if extension:
        used.add(module.proxy)
    else:
        used |= set(module.imports)
        used.discard(module.proxy)
    # Every proxy object's `this` is a wrapped pointer.
    return ''.join(f'from . import {m}\n' for m in sorted(used) + ['_SwigPyObject'])


def _types(module: Module) -> list[PyType]:
    out = []
    for c in module.classes:
        for ep in ([c.constructor] if c.constructor else []) + c.members:
            for cand in ep.candidates:
                out += cand.python.types
            if not ep.candidates:
                for form in ep.forms:
                    out += form.types
        out += [v.python for v in c.variables]
    for p in module.pointer_classes:
        for sig, _ in p.python:
            out += sig.types
    return out


def _values(module: Module, home: str) -> str:
    """The module's constants, and cvar with its variables' types."""
    out = ['\nclass _Variables:\n']
    out += [f'    {v.name}: {v.python.render(home, True)}\n' for v in module.variables] or \
        ['    pass\n']
    out.append('\ncvar: _Variables\n')
    for k in module.start_constants + module.installs:
        if not hasattr(k, 'value'):
            continue
        out.append(f"{k.name}: {type(k.value).__name__}\n")
    return ''.join(out)


def emit_proxy(module: Module) -> str:
    home = module.proxy
    types = _types(module)
    out = [banner(module, f'type stubs of {module.proxy}', '#'),
           f'"""Python classes of the {module.proxy} interface."""\n',
           _typing(module), '\n', f'from . import {module.name}\n', _imports(module, types, False),
           f'\ncvar: {module.name}._Variables\n']
    out += [f'{k.name}: str\n' for k in module.start_constants if isinstance(k.value, str)]
    out += [_pointer_class(p, home) for p in module.pointer_classes]
    out += [_class(c, home) for c in module.classes]
    return ''.join(out)


def _flat(e: MethodEntry, typed: dict[str, tuple[EntryPoint, WrappedClass]], home: str,
          proxy: str) -> str:
    found = typed.get(e.name)
    if found is None or not found[0].forms:
        params = {8: 'arg: Any, /', 4: ''}.get(e.flags, '*args: Any')
        return f'def {e.name}({params}) -> Any: ...\n'
    ep, c = found
    if ep is c.constructor:
        first = ['_self: Any'] if ep.takes_self else []
    else:
        first = [] if ep.static else [f'self: {proxy}.{c.name}']
    out = []
    for sig in ep.forms:
        result = '_SwigPyObject' if ep is c.constructor else sig.result.render(home, True)
        head = f'def {e.name}({_params(sig, home, first)}) -> {result}: ...\n'
        out.append(('@overload\n' if len(ep.forms) > 1 else '') + head)
    return ''.join(out)


def emit_extension(module: Module) -> str:
    home = module.name
    types = _types(module)
    typed: dict[str, tuple[EntryPoint, WrappedClass]] = {}
    for c in module.classes:
        for ep in ([c.constructor] if c.constructor else []) + c.members:
            typed[ep.entry] = (ep, c)
    out = [banner(module, f'type stubs of {module.name}', '#'),
           f'"""The flat built-ins of {module.proxy}, its constants and its variables."""\n',
           _typing(module), '\n', _imports(module, types, True),
           _values(module, home), '\n']
    out += [_flat(e, typed, home, module.proxy) for e in module.entries]
    return ''.join(out)
