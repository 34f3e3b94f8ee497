"""The documentation a module carries at run time: the Python types of every
member and operation, and the texts of the proxy classes' and members'
__doc__ (the headers' comments, then what the application calls on a
subclass and what it expects back, then the constants)."""
from __future__ import annotations

import textwrap

from .pytypes import SCALAR_TYPES, PyType, TypeScope, distinct_forms
from .records import Forward, Module, WrappedClass

CALLS = 'Operations the application calls on a subclass:'
CONSTANTS = 'Constants:'
STATICS = 'Static attributes:'


def _article(word: str) -> str:
    return ('an ' if word[:1].lower() in 'aeiou' else 'a ') + word


def returns(f: Forward, home: str) -> str:
    """What the Python override of `f` is to return, in words."""
    r = f.result
    cls = PyType((r.python.options[0],)).render(home) if r.python else ''
    if r.kind == 'void':
        return 'Its result is not used.'
    if r.kind == 'status':
        return ("Return None when it succeeds, or 'unknown' to leave the decision to the "
                'application; raise an exception to report a failure.')
    if r.kind == 'bool':
        return 'Return True or False; anything but True, and an exception, counts as False.'
    if r.kind == 'scalar':
        if r.converter == 'AsInt' and r.cpp not in SCALAR_TYPES:   # an enumeration
            return f'Return an int, a value of {r.cpp}.'
        word = SCALAR_TYPES.get(r.target, 'int')
        return 'Return a str of one character.' if word == 'str' else f'Return {_article(word)}.'
    if r.kind in ('chars', 'string'):
        return 'Return a str.'
    if r.kind == 'string_array':
        return 'Return a list of str.'
    if r.kind == 'value':
        return f'Return {_article(cls)}; the application keeps a copy.'
    if r.kind == 'reference':
        return f'Return {_article(cls)}, never None; the application takes the object over.'
    return f'Return {_article(cls)} or None; the application takes the object over.'


def _indented(lines: list[str]) -> list[str]:
    return ['    ' + line for line in lines]


def member_doc(c: WrappedClass, ep, forwards: list[Forward], home: str) -> str:
    parts = ['\n'.join(form.describe(home) for form in ep.forms)]
    comments = []
    for cand in ep.candidates:
        if cand.doc and cand.doc not in comments:
            comments.append(cand.doc)
    parts += comments
    if forwards:
        said = []
        for f in forwards:
            if f.returns not in said:
                said.append(f.returns)
        parts.append('\n'.join(['The application calls it on an instance of a subclass that '
                                'overrides it, as'] +
                               _indented([f.python.describe(home) for f in forwards])) +
                     '\n' + textwrap.fill(' '.join(said), 79))
    return '\n\n'.join(parts)


def class_doc(c: WrappedClass, home: str) -> str:
    parts = [c.comment] if c.comment else []
    forwards = c.director_class.forwards if c.director_class else []
    if forwards:
        parts.append('\n'.join([CALLS] + _indented([f.python.describe(home) for f in forwards])))
    if c.constants:
        parts.append('\n'.join([CONSTANTS] + _indented(
            [f'{k.name[len(c.name) + 1:]} = {k.value!r}' for k in c.constants])))
    if c.variables:
        parts.append('\n'.join([STATICS] + _indented(
            [f'{v.name[len(c.name) + 1:]}: {v.python.render(home)}' for v in c.variables])))
    return '\n\n'.join(parts)


def _text_signature(forms) -> str | None:
    params = {len(f.params) for f in forms}
    return forms[0].text_signature() if len(params) == 1 else None


def document(module: Module, scope: TypeScope):
    """Gives every member, operation and class its Python types and texts."""
    home = module.proxy
    for p in module.pointer_classes:
        p.python = scope.pointer_class(p)
    for c in module.classes:
        forwards = c.director_class.forwards if c.director_class else []
        for f in forwards:
            for a in f.args:
                a.python = scope.forward_arg(a)
            f.result.python = scope.forward_result(f.result)
            f.python = scope.forward_signature(f)
            f.returns = returns(f, home)
        for v in c.variables:
            v.python = scope.object(v.descriptor, False)
        entries = ([c.constructor] if c.constructor else []) + c.members
        for ep in entries:
            name = ep.member or c.name
            for cand in ep.candidates:
                cand.python = scope.signature(name, cand, ep.comparison)
            if ep.candidates:
                ep.forms = distinct_forms([cand.python for cand in ep.candidates], scope.shapes)
            elif ep.protocol:   # its forms are the protocol's
                ep.doc = '\n'.join(form.describe(home) for form in ep.forms)
                ep.text_signature = _text_signature(ep.forms)
            if not ep.candidates or ep.accessor == 'set' or ep is c.constructor:
                continue
            if ep.accessor:
                ep.doc = ep.candidates[0].doc
                continue
            mine = [f for f in forwards if f.name == name and f.owner == c.name]
            ep.doc = member_doc(c, ep, mine, home)
            if len(ep.candidates) == 1 and not ep.static:
                ep.text_signature = ep.candidates[0].python.text_signature()
        c.doc = class_doc(c, home)
