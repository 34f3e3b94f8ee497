"""The Python proxy module: one Python class per wrapped class, built from the
extension's flat functions."""
from __future__ import annotations

from .common import banner
from ..model import Module, PointerClass, WrappedClass

_PRELUDE = '''
import weakref

from . import {ext} as _ext
from . import _methods
{imports}
# Members are the module's built-ins themselves, bound as method descriptors:
# a call through an instance reaches the entry point with the instance in
# place, with no Python frame and no bound method in between. A static member
# is the built-in as it is, which no attribute access binds.
_instance_method = _methods.method


def _thisown_get(self):
    return self.this.own()


def _thisown_set(self, value):
    self.this.own(value)


def _proxy_repr(self):
    try:
        this = repr(self.this)
    except AttributeError:
        this = 'no object'
    return f'<{{type(self).__module__}}.{{type(self).__qualname__}}; proxy of {{this}} >'
{value_repr}

class _static_variable:
    """A static variable of the host class, read through the class or an
    instance and written through an instance."""

    def __init__(self, name, get=None, set=None):
        self._name, self._get, self._set = name, get, set

    def __get__(self, obj, cls=None):
        if self._get is None:
            return getattr(cvar, self._name)
        return self._get()

    def __set__(self, obj, value):
        if self._set is None:
            raise AttributeError(f'Variable {{self._name}} is read-only.')
        self._set(value)


cvar = _ext.cvar
'''

_THISOWN = '    thisown = property(_thisown_get, _thisown_set, doc="True when Python owns the object")\n'
_COMMON = _THISOWN + '    __repr__ = _proxy_repr\n\n'

# With value protocols, a class showing its value: an object that no longer
# has one (deleted by the host) shows as any proxy does.
_VALUE_REPR = '''

def _value_repr(entry):
    def __repr__(self):
        try:
            return entry(self)
        except ValueError:
            return _proxy_repr(self)
    return __repr__
'''


def _class(cls: WrappedClass) -> str:
    base = cls.python_base or 'object'
    n = cls.name
    out = [f'\nclass {n}({base}):\n']
    if cls.doc:
        out.append(f'    {cls.doc!r}\n\n')
    shows = any(m.protocol == 'repr' for m in cls.members)
    out.append(_THISOWN + (f'    __repr__ = _value_repr(_ext.{n}___repr__)\n\n' if shows
                           else '    __repr__ = _proxy_repr\n\n'))
    ctor = cls.constructor
    if ctor is None:
        out.append('    def __init__(self, *args, **kwargs):\n'
                   f'        raise AttributeError("No constructor defined for {n}")\n\n')
    elif ctor.takes_self:
        out.append('    def __init__(self, *args):\n'
                   f'        _self = None if type(self) is {n} else self\n'
                   f'        _ext.{n}_swiginit(self, _ext.new_{n}(_self, *args))\n\n')
    else:
        out.append('    def __init__(self, *args):\n'
                   f'        _ext.{n}_swiginit(self, _ext.new_{n}(*args))\n\n')
    out.append(f'    __swig_destroy__ = _ext.delete_{n}\n')
    if cls.members:
        out.append('\n')
    for m in cls.members:
        if m.accessor:
            if m.accessor == 'get':
                doc = f', None, {m.doc!r}' if m.doc else ''
                out.append(f'    {m.field} = property(_ext.{m.entry}, _ext.{m.entry[:-4]}_set{doc})\n')
            continue
        if m.protocol == 'repr':
            continue
        if m.static:
            out.append(f'    {m.member} = _ext.{m.entry}\n')
        elif m.doc:
            out.append(f'    {m.member} = _instance_method(_ext.{m.entry}, {m.doc!r}, '
                       f'{m.text_signature!r})\n')
        else:
            out.append(f'    {m.member} = _instance_method(_ext.{m.entry})\n')
    if cls.director:
        out.append('\n    def __disown__(self):\n'
                   '        self.this.disown()\n'
                   f'        _ext.disown_{n}(self)\n'
                   '        return weakref.proxy(self)\n')
    if cls.constants:
        out.append('\n')
        out += [f'    {c.name[len(n) + 1:]} = _ext.{c.name}\n' for c in cls.constants]
    if cls.variables:
        out.append('\n')
    for v in cls.variables:
        accessors = '' if v.readonly else f', _ext.{v.name}_get, _ext.{v.name}_set'
        out.append(f'    {v.name[len(n) + 1:]} = _static_variable({v.name!r}{accessors})\n')
    out.append(f'\n\n_ext.{n}_swigregister({n})\n')
    return ''.join(out)


def _pointer_class(p: PointerClass) -> str:
    n = p.name
    return (f'\nclass {n}(object):\n' + _COMMON +
            '    def __init__(self):\n'
            f'        _ext.{n}_swiginit(self, _ext.new_{n}())\n\n'
            f'    __swig_destroy__ = _ext.delete_{n}\n\n'
            f'    assign = _instance_method(_ext.{n}_assign)\n'
            f'    value = _instance_method(_ext.{n}_value)\n'
            f'    cast = _instance_method(_ext.{n}_cast)\n'
            f'    frompointer = _ext.{n}_frompointer\n\n\n'
            f'_ext.{n}_swigregister({n})\n')


def emit(module: Module) -> str:
    imports = ''.join(f'from . import {m}\n' for m in module.imports)
    out = [banner(module, f'Python classes over {module.name}', '#'),
           f'"""Python classes of the {module.proxy} interface."""\n',
           _PRELUDE.format(ext=module.name, imports=imports,
                           value_repr=_VALUE_REPR if module.value_protocols else '')]
    out += [f'{c.name} = _ext.{c.name}\n' for c in module.start_constants
            if isinstance(c.value, str)]
    out += [_pointer_class(p) for p in module.pointer_classes]
    out += [_class(c) for c in module.classes]
    return ''.join(out)
