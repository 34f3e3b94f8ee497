"""Python's data model for a module's value classes, decided from their C++
interface (the module's `value_protocols`).

- Operators: a member `operator+` (or one declared outside the class taking
  it) is `__add__`; one taking the class second is `__radd__`; `-x` is
  `__neg__`; `<` and its kin compare. An operand of another type gives
  NotImplemented, so Python tries the other operand. Multiplying by a number
  commutes, so `2 * v` is `v * 2`. Compound assignments are Python's own:
  `a += b` is `a = a + b`.
- Shapes: a class whose `operator[]` reads its data members (all numbers of
  one type: a point's x, y, z, w) is a fixed sequence of them; one with
  `operator[]` and an unsigned `length()` is an array; one built from an
  array of numbers with an `operator()` reading it (a matrix) is a grid of
  rows. Each has `len`, subscripts (negative indices, IndexError past the
  end, slices read), iteration, and writes through a writable `operator[]`
  or a `set(element, index)`. Where its constructor takes the numbers (or,
  for an array, where it can `append`), a Python sequence of that shape
  stands for an object of the class wherever one is taken.
- repr shows the value: the shape's items; else the call of a constructor
  that takes exactly the data members, or whose parameters are each read back
  by an accessor of the same name; else, for a class with `==`, what its
  accessors without arguments read. Unsigned numbers show in hexadecimal.
- hash: a class with `==` that Python cannot change (no data members, no
  member that changes it) hashes what its accessors read: integers, booleans
  and other hashable values, which equal objects read alike. Floating-point
  numbers (compared with tolerance) and text (a name may change) are left out.
- The host's string class is text: str() is its text, it compares equal to
  str and hashes as its text does.
"""
from __future__ import annotations

from dataclasses import dataclass, field

from ..parse import Class, CType, Function, Param
from . import conversions
from .naming import GeneratorError, spell, unqualified
from .pytypes import BOOL, INT, NONE, OBJECT, STR, ClassRef, Generic, PySignature, PyParam, \
    PyType, SCALAR_TYPES, of
from .records import (METH_FASTCALL, METH_O, Arg, Candidate, Descriptor, EntryPoint, Result,
                      WrappedClass)

BINARY = {'operator+': 'add', 'operator-': 'sub', 'operator*': 'mul', 'operator/': 'truediv',
          'operator%': 'mod', 'operator^': 'xor', 'operator|': 'or', 'operator&': 'and',
          'operator<<': 'lshift', 'operator>>': 'rshift'}
UNARY = {'operator-': '__neg__', 'operator+': '__pos__', 'operator~': '__invert__'}
ORDERING = {'operator<': '__lt__', 'operator<=': '__le__', 'operator>': '__gt__',
            'operator>=': '__ge__'}
# The integral results a hash may read.
_HASHED = frozenset({'PyLong_FromLong', 'PyLong_FromSize_t', 'PyBool_FromLong'})


@dataclass
class Element:
    """An item of a shape: a number, or a value of a wrapped class (read as
    a copy)."""
    cpp: str                      # 'double', 'VPoint'
    converter: str = ''           # a number: the convert/ routine reading it
    result: str = ''              # a number: the call making its Python value
    descriptor: Descriptor | None = None   # a value: its class's descriptor
    sequence: str = ''            # a value with a shape: its sequence reader
    # a value made of numbers (a point): the function making it from them, and
    # how many it takes; a buffer of rows of doubles is read through it
    numbers: str = ''
    counts: tuple[int, int] | None = None
    python: PyType | None = None  # what Python gets
    taken: PyType | None = None   # what Python may give

    @property
    def number(self) -> bool:
        return self.descriptor is None


@dataclass
class Shape:
    """How Python reads a class as a sequence. kind: components (a fixed
    count of numbers, its data members), grid (rows of numbers read through
    `operator()`), array (as many elements as its length)."""
    kind: str
    element: Element
    size: int = 0                 # components: the count; grid: the rows
    fields: list[str] = field(default_factory=list)   # components, in order
    counts: tuple[int, int] | None = None   # components: the numbers its constructor takes
    dims: tuple[int, ...] = ()    # grid: its dimensions
    length: str = ''              # array: the member counting elements
    append: str = ''              # array: the member adding one, to build it from a sequence
    assign: str = ''              # 'index' (a writable operator[] / operator()), 'set', ''
    value: Arg | None = None      # the value __setitem__ converts
    reader: str = ''              # the function reading a sequence into an object, if any
    python: PyType | None = None  # the sequences that stand for an object, if any
    index_cpp: str = 'unsigned int'   # the type of an index operator[] or operator() takes
    length_cpp: str = ''          # array: the type length() gives, which bounds its size
    checked: tuple[bool, bool] = (False, False)   # array: append and set give a status
    numbers: str = ''             # components: the function making one from its numbers

    @property
    def itself(self) -> PyType:
        """The sequence an object of the class is: of its items."""
        item = self.element.python
        if self.kind == 'grid':
            item = of(Generic('_Sequence', (item,)))
        return of(Generic('_Sequence', (item,)))


@dataclass
class Part:
    """One value a repr shows or a hash reads: a C++ expression on `self`
    and how it becomes Python."""
    label: str
    expr: str
    result: Result
    hexadecimal: bool = False
    hash: str = ''                # a value: its class's hash function


@dataclass
class ValueRepr:
    """form: shape (the shape's items), call (`Name(parts)`), state
    (`<Name label=part ...>`), text (`Name('...')`)."""
    form: str
    parts: list[Part] = field(default_factory=list)


@dataclass
class Protocols:
    """What a class of the module is to Python beyond its members."""
    shape: Shape | None = None
    repr: ValueRepr | None = None
    hash: list[Part] | None = None   # None: not hashable
    text: bool = False


def hash_function(cls: str) -> str:
    return f'Hash_{cls}'


def reader(cls: str) -> str:
    return f'SequenceTo_{cls}'


def _naked(t: CType) -> CType:
    """The class or number a parameter or result is about: `const T &` is T."""
    if t.kind == 'lvref':
        t = t.inner
    return unqualified(conversions._scalar_target(t))


def _number(t: CType) -> str:
    """The scalar type name of a number type, or ''."""
    t = _naked(t)
    if t.kind == 'builtin' and t.name in conversions.SCALAR_RESULTS and t.name != 'char':
        return t.name
    return ''


def _is_index(p: Param) -> bool:
    t = _naked(p.type)
    return t.kind == 'builtin' and t.name in ('unsigned int', 'int', 'unsigned long', 'long')


def _status(fn: Function) -> bool:
    return fn.result.kind == 'record' and fn.result.name == conversions.STATUS


def _writable(fn: Function) -> bool:
    return not fn.const and fn.result.kind == 'lvref' and not fn.result.inner.const


class Decider:
    """Decides the protocols of every class of a module; `builder` is the
    module's Builder, whose conversions and descriptors it shares."""

    def __init__(self, builder, classes: list[WrappedClass]):
        self.b = builder
        self.strict = builder.m.strict_scalars
        self.wrapped = {c.name: c for c in classes}
        self.classes = classes
        self.protocols: dict[str, Protocols] = {}

    # --- what the headers say --------------------------------------------------------

    def header(self, name: str) -> Class:
        return self.b.h.classes[name]

    def methods(self, name: str) -> list[Function]:
        """Public members of the class and its ancestors, nearest first."""
        chain = [name] + [b for b, declared in self.b.ancestors(name) if declared]
        return [fn for owner in chain for fn in self.header(owner).methods
                if fn.access == 'public' and not fn.static]

    def accessors(self, name: str) -> list[Function]:
        """Const members without parameters that read something, once each."""
        seen, out = set(), []
        for fn in self.methods(name):
            if fn.const and not fn.params and not fn.name.startswith('operator') and \
                    fn.name not in seen and not (fn.result.kind == 'builtin' and
                                                 fn.result.name == 'void'):
                seen.add(fn.name)
                out.append(fn)
        return out

    def fields(self, name: str) -> list:
        return [v for v in self.header(name).variables if not v.static and v.access == 'public']

    def constructors(self, name: str) -> list[Function]:
        cls = self.header(name)
        if cls.abstract:
            return []
        if not cls.constructors:
            return [Function(name, 'public', [])]
        return [c for c in cls.constructors if c.access == 'public']

    def default_constructible(self, name: str) -> bool:
        return any(not [p for p in c.params if p.default is None] for c in self.constructors(name))

    def equality(self, name: str) -> bool:
        wrapped = self.wrapped[name]
        return any(m.comparison and m.member == '__eq__' for m in wrapped.members)

    def unchangeable(self, name: str) -> bool:
        """Python cannot change an object of the class: it has no data
        members and no member that changes it."""
        return not self.fields(name) and not any(
            not fn.const and not fn.name.startswith('operator') for fn in self.methods(name))

    # --- elements and shapes -------------------------------------------------------

    def element(self, t: CType) -> Element | None:
        number = _number(t)
        if number:
            python = of(SCALAR_TYPES[number])
            return Element(number, conversions.scalar_converter(number, self.strict),
                           conversions.SCALAR_RESULTS[number], python=python, taken=python)
        t = _naked(t)
        if t.kind != 'record' or t.name not in self.wrapped:
            return None
        ref = of(ClassRef(self.b.m.proxy, t.name))
        return Element(t.name, descriptor=self.b.class_descriptor(t.name), python=ref, taken=ref)

    def shape(self, name: str) -> Shape | None:
        methods = self.methods(name)
        index = [fn for fn in methods if fn.name == 'operator[]' and len(fn.params) == 1 and
                 _is_index(fn.params[0])]
        reading = sorted(index, key=lambda fn: not fn.const)
        if reading:
            return self.components(name, reading) or self.array(name, reading, methods)
        return self.grid(name, methods)

    def components(self, name: str, index: list[Function]) -> Shape | None:
        number = _number(index[0].result)
        fields = self.fields(name)
        if not number or not fields or any(_number(v.type) != number or v.type.kind != 'builtin'
                                           for v in fields):
            return None
        element = self.element(index[0].result)
        shape = Shape('components', element, len(fields), [v.name for v in fields],
                      assign='index' if any(_writable(fn) for fn in index) else '',
                      index_cpp=spell(_naked(index[0].params[0].type)))
        numeric = [c for c in self.constructors(name)
                   if c.params and all(_number(p.type) == number and p.type.kind == 'builtin'
                                       for p in c.params) and len(c.params) <= len(fields)]
        if numeric:
            widest = max(numeric, key=lambda c: len(c.params))
            shape.counts = (sum(1 for p in widest.params if p.default is None), len(widest.params))
            shape.reader = reader(name)
            shape.numbers = f'NumbersTo_{name}'
            shape.python = of(Generic('_Sequence', (element.taken,)))
        return shape

    def array(self, name: str, index: list[Function], methods: list[Function]) -> Shape | None:
        length = next((fn for fn in methods if fn.name == 'length' and fn.const and
                       not fn.params and _number(fn.result) in ('unsigned int', 'unsigned long')),
                      None)
        element = self.element(index[0].result)
        if length is None or element is None:
            return None
        shape = Shape('array', element, length=length.name,
                      index_cpp=spell(_naked(index[0].params[0].type)),
                      length_cpp=spell(_naked(length.result)))
        setters = [fn for fn in methods if fn.name == 'set' and len(fn.params) == 2 and
                   _naked(fn.params[0].type) == _naked(index[0].result) and
                   _is_index(fn.params[1])]
        if any(_writable(fn) for fn in index):
            shape.assign = 'index'
        elif setters:
            shape.assign = 'set'
        append = [fn for fn in methods if fn.name == 'append' and len(fn.params) == 1 and
                  _naked(fn.params[0].type) == _naked(index[0].result)]
        if append and self.default_constructible(name):
            shape.append = 'append'
            shape.reader = reader(name)
        shape.checked = (bool(append) and _status(append[0]), bool(setters) and _status(setters[0]))
        return shape

    def grid(self, name: str, methods: list[Function]) -> Shape | None:
        built = [(c, conversions.number_array(c.params[0].type)) for c in self.constructors(name)
                 if len(c.params) == 1 and c.params[0].type.kind == 'array']
        built = [(c, n) for c, n in built if n and len(n[1]) == 2 and
                 conversions._innermost(c.params[0].type).const]
        if not built:
            return None
        number, dims = built[0][1]
        call = [fn for fn in methods if fn.name == 'operator()' and len(fn.params) == len(dims)
                and all(_is_index(p) for p in fn.params) and _number(fn.result) == number]
        if not call:
            return None
        element = self.element(call[0].result)
        python = of(Generic('_Sequence', (of(Generic('_Sequence', (element.taken,))),)))
        return Shape('grid', element, dims[0], dims=dims,
                     assign='index' if any(_writable(fn) for fn in call) else '',
                     reader=reader(name), python=python,
                     index_cpp=spell(_naked(call[0].params[0].type)))

    # --- repr and hash ---------------------------------------------------------------

    def part(self, name: str, fn_or_field, label: str) -> Part | None:
        t = fn_or_field.result if isinstance(fn_or_field, Function) else fn_or_field.type
        expr = f'{fn_or_field.name}()' if isinstance(fn_or_field, Function) else fn_or_field.name
        try:
            result = conversions.result(t, name, self.b.descriptor_for)
        except GeneratorError:
            return None
        if result.kind in ('status', 'pointer', 'string_array'):
            return None
        if result.kind == 'reference':
            result = Result('value', result.cpp, descriptor=result.descriptor)
        if result.kind == 'value' and result.cpp not in self.wrapped:
            return None
        unsigned = result.kind == 'scalar' and result.converter == 'PyLong_FromSize_t'
        return Part(label, expr, result, unsigned)

    def call_repr(self, name: str) -> ValueRepr | None:
        """`Name(a, b)`: a constructor taking exactly the data members, or
        one whose parameters its accessors read back by name; every part a
        value that shows as a call itself."""
        fields = self.fields(name)
        ctors = [c for c in self.constructors(name) if c.params]
        types = [spell(unqualified(v.type)) for v in fields]
        if fields and any([spell(_naked(p.type)) for p in c.params] == types for c in ctors):
            parts = [self.part(name, v, v.name) for v in fields]
        else:
            readers = {fn.name: fn for fn in self.accessors(name)}
            parts = None
            for c in ctors:
                if all(p.name in readers and _naked(readers[p.name].result) == _naked(p.type)
                       for p in c.params):
                    parts = [self.part(name, readers[p.name], p.name) for p in c.params]
                    break
            if parts is None:
                return None
        if any(p is None or not self.shows_call(p) for p in parts):
            return None
        return ValueRepr('call', parts)

    def shows_call(self, part: Part) -> bool:
        if part.result.kind != 'value':
            return part.result.kind in ('scalar', 'string', 'chars')
        other = self.protocols.get(part.result.cpp)
        return bool(other and other.repr and other.repr.form in ('shape', 'call', 'text'))

    def state_repr(self, name: str) -> ValueRepr | None:
        if not self.equality(name):
            return None
        parts = [self.part(name, fn, fn.name) for fn in self.accessors(name)]
        return ValueRepr('state', [p for p in parts if p is not None and self.shows_call(p)])

    def hash_parts(self, name: str) -> list[Part] | None:
        if not self.equality(name) or not self.unchangeable(name):
            return None
        out = []
        for fn in self.accessors(name):
            p = self.part(name, fn, fn.name)
            if p is None:
                continue
            if p.result.kind == 'scalar' and p.result.converter in _HASHED:
                out.append(p)
            elif p.result.kind == 'value' and self.protocols.get(p.result.cpp) and \
                    self.protocols[p.result.cpp].hash is not None:
                p.hash = hash_function(p.result.cpp)
                out.append(p)
        return out

    # --- entry points ------------------------------------------------------------

    def special(self, cls: WrappedClass, member: str, protocol: str, sig: PySignature,
                flags: int = METH_FASTCALL) -> EntryPoint:
        entry = f'{cls.name}_{member}'
        ep = EntryPoint(entry, f'wrap_{entry}', flags, [], member=member, protocol=protocol)
        ep.forms = [sig]
        ep.self_arg = conversions.self_argument(cls.name, entry, False, cls.descriptor)
        return ep

    def sequence_entries(self, cls: WrappedClass, shape: Shape) -> list[EntryPoint]:
        item = shape.element.python
        if shape.kind == 'grid':
            item = of(f'tuple[{", ".join([shape.element.python.options[0]] * shape.dims[1])}]')
        key = of('int')
        getitem = PySignature('__getitem__', [PyParam('index', key)], item)
        out = [self.special(cls, '__len__', 'len', PySignature('__len__', [], INT), METH_O),
               self.special(cls, '__getitem__', 'getitem', getitem),
               self.special(cls, '__iter__', 'iter', PySignature(
                   '__iter__', [], of(Generic('Iterator', (item,)))), METH_O)]
        slices = PySignature('__getitem__', [PyParam('index', of('slice'))],
                             of(Generic('list', (item,))))
        forms = [getitem, slices]
        if shape.kind == 'grid':
            pair = of('tuple[int, int]')
            forms.insert(0, PySignature('__getitem__', [PyParam('index', pair)],
                                        shape.element.python))
        out[1].forms = forms
        if shape.assign:
            out.append(self.setitem(cls, shape))
        return out

    def setitem(self, cls: WrappedClass, shape: Shape) -> EntryPoint:
        entry = f'{cls.name}___setitem__'
        t = CType('builtin', shape.element.cpp) if shape.element.number else \
            CType('lvref', inner=CType('record', shape.element.cpp, const=True))
        value = conversions.argument(3, 2, Param('value', t), entry, self.b.descriptor_for,
                                     strict=self.strict)
        shape.value = value
        key = of('tuple[int, int]') if shape.kind == 'grid' else INT
        taken = shape.element.taken
        return self.special(cls, '__setitem__', 'setitem', PySignature(
            '__setitem__', [PyParam('index', key), PyParam('value', taken)], NONE))

    def call_entry(self, cls: WrappedClass, shape: Shape) -> EntryPoint | None:
        """`operator()` with the grid's bounds: m(row, column)."""
        fns = [fn for fn in self.header(cls.name).methods if fn.name == 'operator()' and
               fn.access == 'public' and fn.const and len(fn.params) == len(shape.dims)]
        if not fns:
            return None
        entry = f'{cls.name}___call__'
        cand = self.b.candidate(cls.name, fns[0], entry, f'wrap_{entry}', 2, ctor=False)
        cand.operator = 'call'
        ep = EntryPoint(entry, f'wrap_{entry}', METH_FASTCALL, [cand], member='__call__',
                        protocol='call')
        return ep

    def operand(self, cls: str, fn: Function, entry: str, self_first: bool,
                form: str) -> Candidate | None:
        """A candidate of a binary operator: `self` and the other operand."""
        mine, other = (fn.params[0], fn.params[1]) if self_first else (fn.params[1], fn.params[0])
        try:
            arg = conversions.argument(2, 1, other, entry, self.b.descriptor_for, '', cls,
                                       self.strict)
            result = conversions.result(fn.result, entry, self.b.descriptor_for)
        except GeneratorError:
            return None
        if arg.kind not in ('scalar', 'object', 'string') or arg.optional or result.kind in (
                'reference', 'pointer'):
            return None
        arg.name = other.name or 'other'
        const = _naked(mine.type) == CType('record', cls) and (
            mine.type.kind != 'lvref' or mine.type.inner.const)
        me = conversions.self_argument(cls, entry, const, self.b.class_descriptor(cls))
        types = ','.join(spell(p.type) for p in fn.params)
        return Candidate(f'wrap_{entry}', f'{fn.name}({types})', 2, 2, [me, arg], result,
                         fn.name, operator=form)

    def operators(self, cls: WrappedClass) -> list[EntryPoint]:
        name = cls.name
        groups: dict[str, list[Candidate]] = {}

        def add(member: str, cand: Candidate | None):
            if cand is None:
                return
            cands = groups.setdefault(member, [])
            if not any(c.args[1].spelling == cand.args[1].spelling for c in cands):
                cands.append(cand)

        def mine(p: Param) -> bool:
            return _naked(p.type) == CType('record', name) and p.type.kind in ('record', 'lvref') \
                and (p.type.kind == 'record' or p.type.inner.const)

        for fn in self.header(name).methods:
            if fn.access != 'public' or fn.static or _moves(fn):
                continue
            if fn.name in UNARY and not fn.params:
                entry = f'{name}_{UNARY[fn.name]}'
                cand = self.b.candidate(name, fn, entry, f'wrap_{entry}', 2, ctor=False)
                if cand.result.kind not in ('reference', 'pointer'):
                    cand.operator = 'member'
                    groups.setdefault(UNARY[fn.name], []).append(cand)
            elif len(fn.params) == 1 and (fn.name in BINARY or fn.name in ORDERING):
                member = ORDERING.get(fn.name) or f'__{BINARY.get(fn.name)}__'
                add(member, self.operand_member(name, fn, f'{name}_{member}'))
        for fn in self.b.h.operators:
            if len(fn.params) != 2 or not (fn.name in BINARY or fn.name in ORDERING):
                continue
            if mine(fn.params[0]):
                member = ORDERING.get(fn.name) or f'__{BINARY[fn.name]}__'
                add(member, self.operand(name, fn, f'{name}_{member}', True, 'free'))
            elif mine(fn.params[1]) and fn.name in BINARY:
                member = f'__r{BINARY[fn.name]}__'
                add(member, self.operand(name, fn, f'{name}_{member}', False, 'reflected'))
        # A number times a value is the value times the number.
        for fn in self.header(name).methods:
            if fn.name == 'operator*' and fn.access == 'public' and not fn.static and \
                    len(fn.params) == 1 and _number(fn.params[0].type) and \
                    fn.params[0].type.kind != 'lvref':
                cand = self.operand_member(name, fn, f'{name}___rmul__')
                if cand is not None:
                    cand.operator = 'commuted'
                    add('__rmul__', cand)
        out = []
        for member, cands in groups.items():
            entry = f'{name}_{member}'
            unary = member in UNARY.values()
            # Two operands come as an array, without a tuple made per call.
            ep = EntryPoint(entry, f'wrap_{entry}', METH_O if unary else METH_FASTCALL, cands,
                            member=member, protocol='unary' if unary else 'operator')
            out.append(ep)
        return out

    def operand_member(self, cls: str, fn: Function, entry: str) -> Candidate | None:
        try:
            cand = self.b.candidate(cls, fn, entry, f'wrap_{entry}', 2, ctor=False)
        except GeneratorError:
            return None
        other = cand.args[1]
        if other.kind not in ('scalar', 'object', 'string') or cand.result.kind in (
                'reference', 'pointer'):
            return None
        cand.operator = 'member'
        return cand

    def text_entries(self, cls: WrappedClass) -> list[EntryPoint]:
        other = PyParam('other', OBJECT)
        out = [self.special(cls, '__str__', 'str', PySignature('__str__', [], STR), METH_O),
               self.special(cls, '__eq__', 'text_eq', PySignature('__eq__', [other], BOOL)),
               self.special(cls, '__ne__', 'text_ne', PySignature('__ne__', [other], BOOL)),
               self.special(cls, '__hash__', 'hash', PySignature('__hash__', [], INT), METH_O)]
        for ep in out[1:3]:
            # Text of either kind compares; the message is for text that
            # passes the test and still does not convert.
            ep.message = f"in method '{ep.entry}', argument 2 of type '{cls.name} const &'"
        return out

    # --- the module -----------------------------------------------------------------

    def decide(self):
        for c in self.classes:
            p = self.protocols[c.name] = Protocols()
            p.text = c.name == conversions.STRING
            p.shape = self.shape(c.name)
        # Readers first, so that elements and parts can name them.
        for c in self.classes:
            shape = self.protocols[c.name].shape
            if shape and shape.kind == 'array':
                element = shape.element
                if not element.number:
                    inner = self.protocols[element.cpp].shape
                    if inner and inner.reader:
                        element.sequence = inner.reader
                        element.taken = element.python | inner.python
                    if inner and inner.numbers and inner.element.cpp == 'double':
                        element.numbers, element.counts = inner.numbers, inner.counts
                if shape.reader:
                    shape.python = of(Generic('_Sequence', (element.taken,)))
        for c in self.classes:   # a repr may show another class's
            p = self.protocols[c.name]
            if p.text:
                p.repr = ValueRepr('text')
            elif p.shape and p.shape.kind == 'components':
                p.repr = self.call_repr(c.name) or ValueRepr('shape')
            elif p.shape:
                p.repr = ValueRepr('shape')
        for _ in range(2):   # a call may show another class's call
            for c in self.classes:
                p = self.protocols[c.name]
                if p.repr is None:
                    p.repr = self.call_repr(c.name)
        for c in self.classes:
            p = self.protocols[c.name]
            if p.repr is None:
                p.repr = self.state_repr(c.name)
        for _ in range(2):   # a hash may read another class's
            for c in self.classes:
                p = self.protocols[c.name]
                if not p.text:
                    p.hash = self.hash_parts(c.name)
        for c in self.classes:
            self.apply(c, self.protocols[c.name])

    def apply(self, c: WrappedClass, p: Protocols):
        c.protocols = p
        added: list[EntryPoint] = []
        if p.text:
            added += self.text_entries(c)
        if p.shape:
            added += self.sequence_entries(c, p.shape)
            if p.shape.kind == 'grid':
                call = self.call_entry(c, p.shape)
                if call:
                    added.append(call)
        added += self.operators(c)
        if p.repr:
            added.append(self.special(c, '__repr__', 'repr', PySignature('__repr__', [], STR),
                                      METH_O))
        if p.hash is not None and not p.text:
            added.append(self.special(c, '__hash__', 'hash', PySignature('__hash__', [], INT),
                                      METH_O))
        c.members += added

    def accept_sequences(self):
        """Arguments of the classes with a reader take a sequence of its
        shape, and arrays of numbers take nested sequences; operands of
        operators are taken as they are."""
        for c in self.classes:
            shape = c.protocols.shape
            if shape and shape.value:
                self.accept(shape.value)
            for ep in ([c.constructor] if c.constructor else []) + c.members:
                if ep.protocol:
                    continue
                for cand in ep.candidates:
                    for a in cand.args:
                        self.accept(a)

    def accept(self, a: Arg):
        if a.kind != 'object' or a.is_self or a.descriptor is None:
            return
        if a.array:
            numbers = a.array_of
            if numbers:
                a.shape, a.numbers = numbers[1], (numbers[0], conversions.scalar_converter(
                    numbers[0], self.strict))
            return
        name = a.descriptor.name[len('_p_'):]
        p = self.protocols.get(name)
        if a.reference and p and p.shape and p.shape.reader and \
                (a.spelling.endswith('const &') or a.spelling == name):
            a.sequence, a.value_type = p.shape.reader, name


def _moves(f: Function) -> bool:
    return any(p.type.kind == 'rvref' for p in f.params)


def decide(builder, classes: list[WrappedClass]):
    d = Decider(builder, classes)
    d.decide()
    d.accept_sequences()
