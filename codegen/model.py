"""The binding model. Every rule that a generated module applies is decided
here, once: calling forms, overload candidates and their tests, which
constructors refuse a plain object, type descriptors and their cast lists,
installation order, message texts. Emitters only print what this builds.
"""
from __future__ import annotations

import codecs
import re
import hashlib
import struct
from dataclasses import dataclass, field

from .manifest import Manifest
from .parse import Class, CType, Function, Headers, Param

METH_VARARGS = 1
METH_NOARGS = 4
METH_O = 8

# Scalar parameter types and the routine that converts each.
SCALAR_CONVERTERS = {'int': 'AsInt', 'unsigned int': 'AsUnsignedInt', 'short': 'AsShort',
                     'unsigned char': 'AsUnsignedChar', 'char': 'AsChar', 'bool': 'AsBool',
                     'double': 'AsDouble', 'float': 'AsFloat'}
_NULL_DEFAULTS = frozenset({'0', 'NULL', 'nullptr'})
_LITERAL = re.compile(r'-?(\d+(\.\d*)?([eE]-?\d+)?[fFuUlL]*|true|false)')

# Host types that cross the boundary through the scripting engine's own
# conversions, not as wrapped pointers, when they are arguments or results.
ENGINE_CONVERTED = frozenset({'VString', 'VStringArray'})

REFUSE_PLAIN = 'accessing abstract class or protected constructor'
OVERLOAD_HEAD = "Wrong number or type of arguments for overloaded function '{}'.\n" \
                '  Possible C/C++ prototypes are:\n'


class GeneratorError(Exception):
    pass


# --- type spelling and mangling ------------------------------------------------

def spell(t: CType) -> str:
    """The spelling used in messages and prototypes: 'VObject const &',
    'char const *', 'VSpace::Space', 'floatArrayPtr'."""
    const = ' const' if t.const else ''
    if t.kind in ('builtin', 'record', 'enum', 'typedef'):
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
        return f'{spell(t.inner)} [{t.size}]'
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


def _unqualified(t: CType) -> CType:
    return CType(t.kind, t.name, False, t.inner, t.size, t.args, t.owner)


def pointer_descriptor_name(target: CType) -> tuple[str, str]:
    """Mangled and readable names of the descriptor for pointers to `target`."""
    target = _unqualified(target)
    return '_p_' + _mangle(target), spell(target) + ' *'


def c_string(text: str) -> str:
    """A C++ string literal for `text`."""
    out = text.replace('\\', '\\\\').replace('"', '\\"').replace('\n', '\\n')
    return f'"{out}"'


# --- the model -----------------------------------------------------------------

@dataclass
class Cast:
    source: 'Descriptor'
    converter: str                 # C function converting a source pointer
    derived_cpp: str | None = None  # classes for a checked static_cast, when the
    base_cpp: str | None = None     # headers declare both


@dataclass
class Descriptor:
    name: str
    readable: str
    casts: list[Cast] = field(default_factory=list)
    index: int = -1

    @property
    def macro(self) -> str:
        return 'SWIGTYPE' + self.name


@dataclass
class Arg:
    """One converted argument of a concrete wrapper."""
    number: int                  # counted from 1, the Python object of a director class included
    param: str                   # C++ parameter name
    spelling: str
    kind: str                    # 'object' (a wrapped pointer) or 'scalar'
    cpp: str                     # object: the class pointed to; scalar: the local's type
    message: str
    descriptor: Descriptor | None = None
    reference: bool = False
    null_message: str | None = None
    converter: str = ''          # scalar: the convert/ routine
    cast: str | None = None      # scalar: the enumeration the local is cast to
    default: str | None = None   # C++ value when the argument is absent


@dataclass
class Candidate:
    """One C++ signature behind an entry point."""
    function: str
    prototype: str
    min_args: int
    max_args: int
    args: list[Arg]
    params: list[Param]


@dataclass
class DispatchRule:
    counts: tuple[int, int]       # argc range this rule covers
    candidates: list[Candidate]   # tried in order; the last one unconditionally
    tests: list[Arg | None] = field(default_factory=list)  # check-only conversion per candidate


@dataclass
class Constructor:
    entry: str                    # "new_VPxNode"
    function: str
    flags: int
    takes_self: bool              # argument 1 is the Python object (director classes)
    refuse_plain: bool
    candidates: list[Candidate]
    dispatch: list[DispatchRule] = field(default_factory=list)
    max_args: int = 0
    message: str = ''             # the overload message, when there is a dispatcher


@dataclass
class Constant:
    name: str
    value: int | str
    cpp: str = ''                 # the enumerator, "VPxNode::kDependNode"


@dataclass
class GlobalVariable:
    name: str                     # Python name, "VPxNode_message"
    cpp: str                      # "VPxNode::message"
    spelling: str                 # the value type, "VObject"
    descriptor: Descriptor
    readonly: bool

    @property
    def message(self) -> str:
        if self.readonly:
            return f'Variable {self.name} is read-only.'
        return f"in variable '{self.cpp}' of type '{self.spelling}'"

    @property
    def null_message(self) -> str:
        return 'invalid null reference ' + self.message


@dataclass
class WrappedClass:
    name: str
    family: str
    header: str
    director: bool
    descriptor: Descriptor
    base: str | None              # nearest wrapped or known base, C++ name
    python_base: str | None       # "VPxNode" or "OpenVorla.VFnBase"
    polymorphic: bool
    constructor: Constructor | None
    constants: list[Constant]
    variables: list[GlobalVariable]

    @property
    def delete_entry(self) -> str:
        return f'delete_{self.name}'


@dataclass
class MethodEntry:
    name: str
    function: str
    flags: int


@dataclass
class Module:
    name: str                     # "_OpenVorlaVPx"
    proxy: str                    # "OpenVorlaVPx"
    source: str                   # manifest path, for banners
    namespace: str
    headers: list[str]
    imports: list[str]
    classes: list[WrappedClass]
    descriptors: list[Descriptor]
    entries: list[MethodEntry]
    start_constants: list[Constant]
    installs: list[Constant | GlobalVariable]
    api_version: str

    @property
    def ident(self) -> str:
        return self.proxy

    @property
    def families(self) -> dict[str, list[WrappedClass]]:
        out: dict[str, list[WrappedClass]] = {}
        for c in self.classes:
            out.setdefault(c.family, []).append(c)
        return dict(sorted(out.items()))

    @property
    def integer_constants(self) -> list[Constant]:
        return [c for c in self.start_constants + self.installs
                if isinstance(c, Constant) and isinstance(c.value, int)]

    @property
    def variables(self) -> list[GlobalVariable]:
        return [v for v in self.installs if isinstance(v, GlobalVariable)]

    def signature(self) -> bytes:
        """The 128-byte block the host reads from a plug-in file: a magic, the
        interface version, the module's counts, its name and a digest of its
        interface, so the host can tell builds apart without importing them."""
        head = b'HLVNPSIG' + struct.pack('<IIIII', int(self.api_version or 0), len(self.entries),
                                         len(self.descriptors), len(self.integer_constants),
                                         len(self.variables))
        block = head + bytes(4) + self.name.encode()[:31].ljust(32, b'\0') + self.interface_digest()
        return block.ljust(128, b'\0')

    def interface_digest(self) -> bytes:
        """A digest of what the module offers, for the plug-in signature."""
        h = hashlib.sha256()
        for e in self.entries:
            h.update(f'entry {e.name} {e.flags}\n'.encode())
        for d in self.descriptors:
            h.update(f'type {d.name} {d.readable} {[c.source.name for c in d.casts]}\n'.encode())
        for c in self.start_constants + self.installs:
            h.update(f'value {c.name}\n'.encode())
        return h.digest()


class _Builder:
    def __init__(self, manifest: Manifest, headers: Headers):
        self.m = manifest
        self.h = headers
        self.descriptors: dict[str, Descriptor] = {}
        self.derived: set[str] = set()

    # descriptors

    def descriptor(self, name: str, readable: str, derived: bool = True) -> Descriptor:
        d = self.descriptors.get(name)
        if d is None:
            d = self.descriptors[name] = Descriptor(name, readable)
        if derived:
            self.derived.add(name)
        return d

    def class_descriptor(self, cls: str) -> Descriptor:
        return self.descriptor(*pointer_descriptor_name(CType('record', cls)))

    def type_descriptor(self, t: CType) -> Descriptor | None:
        """The descriptor that a declaration of type `t` needs, if any."""
        inner = t.inner if t.kind in ('pointer', 'lvref') else t
        if inner.kind == 'typedef' and inner.inner.kind == 'record':
            inner = inner.inner
        if inner.kind != 'record':
            return None
        return self.descriptor(*pointer_descriptor_name(inner))

    def add_cast(self, target: Descriptor, source: Descriptor,
                 derived_cpp: str | None, base_cpp: str | None):
        if any(c.source is source for c in target.casts):
            return
        converter = f'cast{source.name}To{target.name}'
        target.casts.append(Cast(source, converter, derived_cpp, base_cpp))

    # classes

    def header_class(self, name: str) -> Class:
        cls = self.h.classes.get(name)
        if cls is None:
            raise GeneratorError(f'class {name} is not defined by any header')
        return cls

    def ancestors(self, name: str) -> list[tuple[str, bool]]:
        """Public ancestors, nearest first, with whether headers declare them."""
        out = []
        while True:
            cls = self.h.classes.get(name)
            if cls is not None:
                bases = [b for b, access in cls.bases if access == 'public']
                if len(bases) > 1:
                    raise GeneratorError(f'{name}: more than one public base')
                base = bases[0] if bases else None
            else:
                base = self.m.bases.get(name)
            if base is None:
                return out
            out.append((base, base in self.h.classes))
            name = base

    def arg(self, number: int, p: Param, entry: str) -> Arg:
        """How argument `number` of `entry` is converted, and its messages."""
        t = p.type
        unsupported = GeneratorError(f'{entry}: parameter {p.name} of type {spell(t)} '
                                     'has no conversion yet')
        if t.kind == 'enum' or (t.kind == 'builtin' and t.name in SCALAR_CONVERTERS):
            s = spell(_unqualified(t))
            message = f"in method '{entry}', argument {number} of type '{s}'"
            default = None
            if p.default is not None:
                default = _scalar_default(t, p.default)
                if default is None:
                    raise unsupported
            if t.kind == 'enum':
                return Arg(number, p.name, s, 'scalar', 'int', message, converter='AsInt',
                           cast=t.name, default=default)
            return Arg(number, p.name, s, 'scalar', t.name, message,
                       converter=SCALAR_CONVERTERS[t.name], default=default)
        if t.kind not in ('pointer', 'lvref') or t.inner.kind != 'record' \
                or t.inner.name in ENGINE_CONVERTED:
            raise unsupported
        s = spell(t)
        message = f"in method '{entry}', argument {number} of type '{s}'"
        ref = t.kind == 'lvref'
        if p.default is not None and (ref or p.default not in _NULL_DEFAULTS):
            raise unsupported
        return Arg(number, p.name, s, 'object', t.inner.name, message,
                   descriptor=self.type_descriptor(t), reference=ref,
                   null_message='invalid null reference ' + message if ref else None,
                   default='nullptr' if p.default is not None else None)

    def constructor(self, cls: Class, director: bool) -> Constructor | None:
        public = [c for c in cls.constructors if c.access == 'public']
        refuse = cls.abstract or (bool(cls.constructors) and not public)
        if not director and refuse:
            return None
        usable = [c for c in cls.constructors if c.access == 'public'
                  or (director and c.access == 'protected')]
        if not cls.constructors:
            usable = [Function(cls.name, 'public', [])]
        usable = [c for c in usable if not _is_copy(c, cls.name)]
        entry = f'new_{cls.name}'
        first = 2 if director else 1
        cands = []
        for i, ctor in enumerate(usable):
            args = [self.arg(first + j, p, entry) for j, p in enumerate(ctor.params)]
            required = sum(1 for p in ctor.params if p.default is None)
            types = (['PyObject *'] if director else []) + [spell(p.type) for p in ctor.params]
            proto = f"{cls.name}::{cls.name}({','.join(types)})"
            fn = f'wrap_{entry}' if len(usable) == 1 else f'wrap_{entry}_{i + 1}'
            base = first - 1
            cands.append(Candidate(fn, proto, base + required, base + len(ctor.params),
                                   args, ctor.params))
        if len(cands) == 1 and cands[0].max_args == (1 if director else 0):
            flags = METH_O if director else METH_NOARGS
        else:
            flags = METH_VARARGS
        ctor = Constructor(entry, f'wrap_{entry}', flags, director, refuse, cands)
        if len(cands) > 1:
            ctor.dispatch = _dispatch_rules(cands)
            ctor.max_args = max(c.max_args for c in cands)
            ctor.message = OVERLOAD_HEAD.format(entry) + ''.join(
                f'    {c.prototype}\n' for c in cands)
        return ctor

    def wrapped_class(self, entry) -> WrappedClass:
        cls = self.header_class(entry.name)
        desc = self.class_descriptor(cls.name)
        ancestors = self.ancestors(cls.name)
        for ancestor, declared in ancestors:
            if declared:
                self.class_descriptor(ancestor)
        base = ancestors[0][0] if ancestors else None
        python_base = None
        if base is not None:
            if any(c.name == base for c in self.m.classes):
                python_base = base
            elif self.m.imports:
                python_base = f'{self.m.imports[0]}.{base}'
        constants = [Constant(f'{cls.name}_{n}', v, f'{cls.name}::{n}') for e in cls.enums
                     if e.access == 'public' for n, v in e.enumerators]
        variables = []
        for v in cls.variables:
            if not v.static or v.access != 'public':
                continue
            d = self.descriptor(*pointer_descriptor_name(v.type))
            variables.append(GlobalVariable(f'{cls.name}_{v.name}', f'{cls.name}::{v.name}',
                                            spell(_unqualified(v.type)), d, v.type.const))
        for ctor in cls.constructors:
            for p in ctor.params:
                self.type_descriptor(p.type)
        return WrappedClass(cls.name, entry.family, entry.header, entry.director, desc, base,
                            python_base, cls.polymorphic,
                            self.constructor(cls, entry.director), constants, variables)

    def casts(self):
        """Every class with a descriptor converts to each ancestor with one."""
        names = list(self.h.classes) + [n for n in self.m.bases if n not in self.h.classes]
        for name in names:
            source = self.descriptors.get(self.class_descriptor_name(name))
            if source is None:
                continue
            for base, _ in self.ancestors(name):
                target = self.descriptors.get(self.class_descriptor_name(base))
                if target is None:
                    continue
                both = name in self.h.classes and base in self.h.classes
                self.add_cast(target, source, name if both else None, base if both else None)
        for target, sources in self.m.casts.items():
            for s in sources:
                if target not in self.descriptors or s not in self.descriptors:
                    raise GeneratorError(f'{self.m.source}: cast {s} -> {target} names an '
                                         'unknown type')
                self.add_cast(self.descriptors[target], self.descriptors[s], None, None)
        for d in self.descriptors.values():
            d.casts.sort(key=lambda c: c.source.name.encode())

    @staticmethod
    def class_descriptor_name(cls: str) -> str:
        return pointer_descriptor_name(CType('record', cls))[0]

    def build(self) -> Module:
        classes = [self.wrapped_class(e) for e in self.m.classes]
        for name, readable in self.m.types.items():
            if name in self.descriptors:
                raise GeneratorError(f'{self.m.source}: type {name} is derived from the '
                                     'headers; remove it from the manifest')
            self.descriptor(name, readable, derived=False)
        self.casts()
        descriptors = sorted(self.descriptors.values(), key=lambda d: d.name.encode())
        for i, d in enumerate(descriptors):
            d.index = i

        entries = [MethodEntry('SWIG_PyInstanceMethod_New', 'swigrt::PyInstanceMethod_New', METH_O),
                   MethodEntry('SWIG_PyStaticMethod_New', 'swigrt::PyStaticMethod_New', METH_O)]
        for c in classes:
            if c.constructor:
                entries.append(MethodEntry(c.constructor.entry, c.constructor.function,
                                           c.constructor.flags))
            entries.append(MethodEntry(c.delete_entry, f'wrap_{c.delete_entry}', METH_O))
            if c.director:
                entries.append(MethodEntry(f'disown_{c.name}', f'wrap_disown_{c.name}', METH_O))
            entries.append(MethodEntry(f'{c.name}_swigregister', f'wrap_{c.name}_swigregister',
                                       METH_O))
            entries.append(MethodEntry(f'{c.name}_swiginit', 'swigrt::ShadowInit', METH_VARARGS))

        start = [Constant(name, self.string_macro(name), name) for name in self.m.string_constants]
        installs: list[Constant | GlobalVariable] = []
        if classes:
            # The first class's constants go in with the explicit ones, before the
            # link object exists; its variables lead the link's registrations.
            start += classes[0].constants
            installs += classes[0].variables
            for c in classes[1:]:
                installs += c.constants + c.variables
        api = self.h.macros.get(self.m.api_version_macro, '') if self.m.api_version_macro else ''
        return Module(self.m.name, self.m.proxy, self.m.source, self.m.namespace,
                      [c.header for c in self.m.classes], self.m.imports, classes, descriptors,
                      entries, start, installs, api)

    def string_macro(self, name: str) -> str:
        text = self.h.macros.get(name)
        if text is None or not (text.startswith('"') and text.endswith('"')):
            raise GeneratorError(f'{name} is not a string macro of the headers')
        raw = codecs.escape_decode(text[1:-1].encode())[0]
        return raw.decode('utf-8', 'surrogateescape')


def _scalar_default(t: CType, text: str) -> str | None:
    """The C++ value of a default argument, usable outside the class: a
    literal, or an enumerator qualified by its enumeration's scope."""
    if _LITERAL.fullmatch(text):
        return text
    if t.kind == 'enum' and re.fullmatch(r'[A-Za-z_]\w*', text):
        scope = t.name.rpartition('::')[0]
        return f'{scope}::{text}' if scope else text
    return None


def _is_copy(f: Function, cls: str) -> bool:
    if len(f.params) != 1:
        return False
    t = f.params[0].type
    return t.kind in ('lvref', 'rvref') and t.inner.kind == 'record' and t.inner.name == cls


def _dispatch_rules(cands: list[Candidate]) -> list[DispatchRule]:
    """Groups argument counts by the candidates that accept them; where several
    accept one count, each but the last is tested on the first argument in
    which it differs from the candidates after it."""
    lo = min(c.min_args for c in cands)
    hi = max(c.max_args for c in cands)
    rules: list[DispatchRule] = []
    for argc in range(lo, hi + 1):
        group = [c for c in cands if c.min_args <= argc <= c.max_args]
        if not group:
            continue
        if rules and rules[-1].candidates == group and rules[-1].counts[1] == argc - 1:
            rules[-1].counts = (rules[-1].counts[0], argc)
        else:
            rules.append(DispatchRule((argc, argc), group))
    for rule in rules:
        for i, c in enumerate(rule.candidates):
            if i == len(rule.candidates) - 1:
                rule.tests.append(None)
                continue
            others = rule.candidates[i + 1:]
            for k, a in enumerate(c.args):
                if any(len(o.args) <= k or o.args[k].spelling != a.spelling for o in others):
                    rule.tests.append(a)
                    break
            else:
                raise GeneratorError(f'{c.prototype}: no argument tells it apart')
    return rules


def build(manifest: Manifest, headers: Headers) -> Module:
    return _Builder(manifest, headers).build()
