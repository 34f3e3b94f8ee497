"""How a test host calls every forwarding override of every director class,
as the application would: which local stands for each argument.

The application always passes real objects; a test host makes them itself.
A class the headers define with a public default constructor is made on the
spot; an abstract one (or one without such a constructor) is taken from a
sample object the test supplies; a class the headers only declare gets
zeroed storage, since nothing but its address crosses into Python; pointers
are null, except text, which is a short string.
"""
from __future__ import annotations

from dataclasses import dataclass

from ..parse import CType, Headers
from .naming import spell, unqualified
from .records import Forward, Module


@dataclass
class DriveArg:
    how: str          # value, sample, storage, null, text, istream, ostream
    local: str        # the type of the local that stands for the argument
    descriptor: str = ''   # sample: the descriptor the sample converts to


@dataclass
class DriveCall:
    cls: str
    forward: Forward
    args: list[DriveArg]

    @property
    def member_pointer(self) -> str:
        f = self.forward
        params = ', '.join(a.cpp for a in f.args)
        return f'{f.result.cpp} ({f.owner}::*)({params}){" const" if f.const else ""}'


def _constructible(headers: Headers, name: str) -> bool:
    cls = headers.classes.get(name)
    if cls is None or cls.abstract:
        return False
    if not cls.constructors:
        return True
    return any(c.access == 'public' and all(p.default is not None for p in c.params)
               for c in cls.constructors)


def _arg(headers: Headers, t: CType) -> DriveArg:
    inner = t.inner if t.kind in ('pointer', 'lvref') else t
    if inner.name in ('std::istream', 'std::ostream'):
        return DriveArg(inner.name[len('std::'):], inner.name)
    while inner.kind == 'typedef' and inner.inner is not None and inner.inner.kind != 'record':
        inner = inner.inner
    local = spell(unqualified(inner))
    if t.kind == 'pointer':
        if inner.kind == 'builtin' and inner.name == 'char':
            return DriveArg('text', 'char')
        return DriveArg('null', spell(t))
    if inner.kind != 'record':
        return DriveArg('value', local)          # scalars and enumerations, zeroed
    if _constructible(headers, inner.name):
        return DriveArg('value', local)
    if inner.name in headers.classes:
        return DriveArg('sample', local, '_p_' + inner.name.replace('::', '__'))
    return DriveArg('storage', local)


def drive_calls(module: Module, headers: Headers) -> list[DriveCall]:
    """One call per forwarding override, in the order of the directors."""
    return [DriveCall(d.cls, f, [_arg(headers, a.type) for a in f.args])
            for d in module.directors for f in d.forwards]
