"""The built module against the class catalogue, class by class: entry points,
directors and what they forward, and the totals of the method table.

Run as a script, it prints every difference at once, measured on the
generator's model alone (no build needed), or on the built module with --built:
    /usr/bin/python3 tests/wrap/test_catalogue.py [--built]
"""
import collections
import os
import sys

HERE = os.path.dirname(os.path.abspath(__file__))
ROOT = os.path.dirname(os.path.dirname(HERE))
METH_VARARGS, METH_NOARGS, METH_O = 1, 4, 8
# The overloaded readers of the content tables, written by hand in wrap/.
HANDWRITTEN_DISPATCHERS = 2


def read_catalogue():
    sections, current = {}, None
    with open(os.path.join(HERE, 'catalogue.txt')) as f:
        for line in f:
            line = line.split('#')[0].strip()
            if line.startswith('['):
                current = sections.setdefault(line.strip('[]'), [])
            elif line:
                current.append(line.split())
    return sections


def load_model():
    from codegen.__main__ import load_module
    cwd = os.getcwd()
    os.chdir(ROOT)
    try:
        return load_module('wrap/OpenVorlaVPx.toml', ['host/include'])
    finally:
        os.chdir(cwd)


def method_table(ext):
    """(name, flags) of every built-in function, in table order."""
    sys.path.insert(0, HERE)
    from test_module import builtins, method_flags
    return [(k, method_flags(v)) for k, v in builtins(ext)]


def entries_by_class(table, classes):
    """Each class's entries run from new_<Class> to <Class>_swiginit."""
    out, current = collections.Counter(), None
    for name, _ in table:
        for c in classes:
            if name in (f'new_{c}', f'delete_{c}'):
                current = c
                break
        if current:
            out[current] += 1
        if current and name == f'{current}_swiginit':
            current = None
    return out


def differences(table, model):
    """Every way the method table and the model differ from the catalogue,
    one line each."""
    cat = read_catalogue()
    rows = {r[0]: r for r in cat['classes']}
    counts = entries_by_class(table, list(rows))
    names = {n for n, _ in table}
    wrapped = {c.name: c for c in model.classes}
    out = []

    for name, base, director, entries, functions, forwards, arity in cat['classes']:
        c = wrapped.get(name)
        if c is None:
            out.append(f'{name}: not wrapped')
            continue
        got = []
        if (c.base or 'none') != base:
            got.append(f'base {c.base}, not {base}')
        if (f'disown_{name}' in names) != (director == 'yes') or \
                bool(c.director_class) != (director == 'yes'):
            got.append('director' if director == 'no' else 'no director')
        if counts[name] != int(entries):
            got.append(f'{counts[name]} entry points, not {entries} ({counts[name] - int(entries):+d})')
        d = c.director_class
        if d:
            n_arity = sum(1 for f in d.forwards if f.arity)
            if len(d.forwards) != int(forwards):
                got.append(f'{len(d.forwards)} forwarding overrides, not {forwards} '
                           f'({len(d.forwards) - int(forwards):+d})')
            if n_arity != int(arity):
                got.append(f'{n_arity} with an arity test, not {arity}')
            if d.function_count != int(functions):
                got.append(f'{d.function_count} director functions, not {functions} '
                           f'({len(d.constructors)} constructors, {len(d.companions)} companions)')
        out += [f'{name}: {g}' for g in got]

    def results(kind):
        return collections.Counter((d.cls, f.name) for d in model.directors for f in d.forwards
                                   if f.result.kind == kind)

    def expected(section):
        want = collections.Counter()
        for cls, method in cat[section]:
            for c in ([d.cls for d in model.directors] if cls == '*' else [cls]):
                if cls != '*' or any(f.name == method for f in wrapped[c].director_class.forwards):
                    want[(c, method)] += 1
        return want

    for section, kind in (('string results', 'string'), ('string array results', 'string_array')):
        got, want = results(kind), expected(section)
        for key in sorted(set(got) | set(want)):
            if got[key] != want[key]:
                out.append(f'{key[0]}::{key[1]}: {got[key]} {kind} results, not {want[key]}')
    typeids = {(d.cls, f.name) for d in model.directors for f in d.forwards
               if f.result.kind == 'value' and f.result.target == 'VTypeId'}
    for key in sorted(typeids ^ {tuple(r) for r in cat['type id results']}):
        out.append(f'{key[0]}::{key[1]}: VTypeId result {"unexpected" if key in typeids else "missing"}')
    node_like = [d.cls for d in model.directors if d.cls == 'VPxNode' or
                 any(b == 'VPxNode' for b in ancestry(wrapped, d.cls))]
    lists = collections.Counter(d.cls for d in model.directors for f in d.forwards
                                if f.name == 'getFilesToArchive')
    if sorted(lists) != sorted(node_like) or len(node_like) != 26:
        out.append(f'getFilesToArchive forwarded by {len(lists)} classes, not the 26 node-like ones')

    pure = {(d.cls, f.name) for d in model.directors for f in d.forwards
            if f.pure and f.owner == d.cls}
    want_pure = {(r[0], n) for r in cat['pure virtual'] for n in r[1:]}
    for key in sorted(pure ^ want_pure):
        out.append(f'{key[0]}::{key[1]}: {"unexpectedly" if key in pure else "not"} pure virtual')

    protected = {f.name for d in model.directors for f in d.forwards if f.protected}
    for row in cat['protected forwards']:
        for n in row[1:]:
            if n not in protected:
                out.append(f'{n}: not a protected forwarded member')
    arity_names = set(cat['arity names'][0])
    tested = {f.name for d in model.directors for f in d.forwards if f.arity}
    for n in sorted(arity_names - tested):
        out.append(f'{n}: no forwarding override with an arity test')

    totals = {k: int(v) for k, v in cat['totals']}
    flags = collections.Counter(f for _, f in table)
    dispatchers = sum(1 for c in model.classes
                      for e in ([c.constructor] if c.constructor else []) + c.members
                      if e.dispatch) + HANDWRITTEN_DISPATCHERS
    have = {'entries': len(table), 'tuple': flags[METH_VARARGS], 'object': flags[METH_O],
            'none': flags[METH_NOARGS], 'dispatchers': dispatchers,
            'forwards': sum(len(d.forwards) for d in model.directors),
            'arity': sum(1 for d in model.directors for f in d.forwards if f.arity),
            'director_functions': sum(d.function_count for d in model.directors),
            'directors': len(model.directors)}
    for k, v in totals.items():
        if have[k] != v:
            out.append(f'total {k}: {have[k]}, not {v} ({have[k] - v:+d})')
    return out


def ancestry(wrapped, name):
    out = []
    while wrapped[name].base in wrapped:
        name = wrapped[name].base
        out.append(name)
    return out


def test_the_module_matches_the_catalogue():
    from openvorla import _OpenVorlaVPx as ext
    found = differences(method_table(ext), load_model())
    assert not found, f'{len(found)} differences:\n' + '\n'.join(found)


if __name__ == '__main__':
    build = os.path.join(ROOT, os.environ.get('OPENVORLA_BUILD', 'build'))
    sys.path[:0] = [os.path.join(build, 'python'), ROOT]
    model = load_model()
    if '--built' in sys.argv:
        from openvorla import _OpenVorlaVPx
        table = method_table(_OpenVorlaVPx)
    else:
        table = [(e.name, e.flags) for e in model.entries]
    found = differences(table, model)
    print('\n'.join(found) or 'the module matches the catalogue')
    print(f'{len(found)} differences')
