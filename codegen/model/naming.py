"""How C++ types are spelled in messages and prototypes, and mangled into
descriptor names."""
from __future__ import annotations

from ..parse import CType


class GeneratorError(Exception):
    pass


def spell(t: CType) -> str:
    """The spelling used in messages and prototypes: 'VObject const &',
    'char const *', 'VSpace::Space', 'double (*)[4]'."""
    const = ' const' if t.const else ''
    if t.kind in ('builtin', 'record', 'enum', 'typedef', 'unexposed'):
        return t.name + const
    if t.kind == 'pointer':
        if t.inner.kind == 'array':
            return f'{spell(t.inner.inner)} (*)[{t.inner.size}]' + const
        return spell(t.inner) + ' *' + const
    if t.kind == 'lvref':
        return spell(t.inner) + ' &'
    if t.kind == 'rvref':
        return spell(t.inner) + ' &&'
    if t.kind == 'array':
        dims, elem = '', t
        while elem.kind == 'array':
            dims, elem = dims + f'[{elem.size}]', elem.inner
        return f'{spell(elem)} {dims}'
    raise GeneratorError(f'no spelling for a {t.kind} type')


def _mangle(t: CType) -> str:
    body = {'builtin': lambda: t.name.replace(' ', '_'),
            'record': lambda: t.name.replace('::', '__'),
            'enum': lambda: t.name.replace('::', '__'),
            'typedef': lambda: t.name.replace('::', '__'),
            'pointer': lambda: 'p_' + _mangle(t.inner),
            'array': lambda: f'a_{t.size}__' + _mangle(t.inner)}.get(t.kind)
    if body is None:
        raise GeneratorError(f'cannot mangle a {t.kind} type')
    return ('q_const__' if t.const else '') + body()


def unqualified(t: CType) -> CType:
    return CType(t.kind, t.name, False, t.inner, t.size, t.args, t.owner)


def pointer_descriptor_name(target: CType) -> tuple[str, str]:
    """Mangled and readable names of the descriptor for pointers to `target`."""
    target = unqualified(target)
    return '_p_' + _mangle(target), spell(target) + ' *'


def c_string(text: str) -> str:
    """A C++ string literal for `text`."""
    out = text.replace('\\', '\\\\').replace('"', '\\"').replace('\n', '\\n')
    return f'"{out}"'
