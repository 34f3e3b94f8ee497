"""Loads a module manifest: the classes to wrap, in registration order, and
the few facts that the headers cannot express."""
from __future__ import annotations

import tomllib
from dataclasses import dataclass, field


@dataclass
class ClassEntry:
    name: str
    family: str
    director: bool = True
    header: str = ''


@dataclass
class Manifest:
    name: str                      # extension module name, "_OpenVorlaVPx"
    proxy: str                     # generated Python module, "OpenVorlaVPx"
    namespace: str                 # SDK namespace stripped from names
    classes: list[ClassEntry]
    header_dir: str = 'openvorla'  # where "<Class>.h" lives below the include dir
    api_version_macro: str = ''
    string_constants: list[str] = field(default_factory=list)
    imports: list[str] = field(default_factory=list)       # sibling proxy modules
    # Proxy modules that share the type table without being imported: the
    # Python types of this one may name their classes.
    siblings: list[str] = field(default_factory=list)
    types: dict[str, str] = field(default_factory=dict)    # mangled -> readable
    bases: dict[str, str] = field(default_factory=dict)    # known-by-name class -> base
    casts: dict[str, list[str]] = field(default_factory=dict)  # target -> sources
    pointer_classes: list[tuple[str, str]] = field(default_factory=list)  # (class, scalar)
    functions: list[str] = field(default_factory=list)  # hand-written, no arguments
    # The host function announcing that a Python callable stands where it
    # expects a function pointer; called once per callable passed.
    callable_announcement: str = ''
    skip: list[str] = field(default_factory=list)        # "Class::member" not wrapped
    # String resources of the scripting engine the module declares: table, keys
    # in order of construction.
    resource_table: str = ''
    resources: list[str] = field(default_factory=list)
    handwritten: dict[str, list[str]] = field(default_factory=dict)  # class -> members in wrap/
    # The classes behave as Python values: their operators, subscripts, lengths,
    # reprs and hashes are Python's, and sequences of the right shape stand for
    # them where they are taken.
    value_protocols: bool = False
    # Booleans take only bool, numbers only what Python's number protocols
    # make a number of, and text only str: a wrong one stops the call.
    strict_scalars: bool = False
    source: str = ''               # manifest path as given, for banners


class ManifestError(Exception):
    pass


def load(path: str, display_name: str | None = None) -> Manifest:
    with open(path, 'rb') as f:
        data = tomllib.load(f)
    try:
        mod = data['module']
        classes = []
        for c in mod['classes']:
            unknown = set(c) - {'name', 'family', 'director', 'header'}
            if unknown:
                raise ManifestError(f'{path}: class {c.get("name")}: unknown keys {sorted(unknown)}')
            classes.append(ClassEntry(c['name'], c['family'], c.get('director', True),
                                      c.get('header', '')))
        m = Manifest(
            name=mod['name'], proxy=mod['proxy'], namespace=mod.get('namespace', ''),
            classes=classes, header_dir=mod.get('header_dir', 'openvorla'),
            api_version_macro=mod.get('api_version_macro', ''),
            string_constants=list(mod.get('string_constants', [])),
            imports=list(mod.get('imports', [])),
            siblings=list(mod.get('siblings', [])),
            types=dict(data.get('types', {})), bases=dict(data.get('bases', {})),
            casts={k: list(v) for k, v in data.get('casts', {}).items()},
            pointer_classes=[(p['name'], p['type']) for p in mod.get('pointer_classes', [])],
            functions=list(mod.get('functions', [])),
            callable_announcement=mod.get('callable_announcement', ''),
            skip=list(mod.get('skip', [])),
            resource_table=mod.get('resource_table', ''),
            resources=list(mod.get('resources', [])),
            handwritten={k: list(v) for k, v in data.get('handwritten', {}).items()},
            value_protocols=bool(mod.get('value_protocols', False)),
            strict_scalars=bool(mod.get('strict_scalars', False)),
            source=display_name or path)
    except KeyError as e:
        raise ManifestError(f'{path}: missing key {e}') from None
    for c in m.classes:
        if not c.header:
            c.header = f'{m.header_dir}/{c.name}.h'
    names = [c.name for c in m.classes]
    if len(set(names)) != len(names):
        raise ManifestError(f'{path}: a class is listed twice')
    return m
