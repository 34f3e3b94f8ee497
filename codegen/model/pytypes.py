"""The Python side of a module's interface: the Python type of each argument
and result kind, the parameter names and defaults Python sees, and the
signatures of entry points and of the operations the application calls.
Stubs and run-time documentation print these."""
from __future__ import annotations

import ast
import codecs
import keyword
import re
from dataclasses import dataclass, field

from ..parse import CType
from .naming import pointer_descriptor_name

# The Python type of each scalar C++ type, as an argument and as a result.
SCALAR_TYPES = {'int': 'int', 'unsigned int': 'int', 'short': 'int', 'unsigned char': 'int',
                'long': 'int', 'char': 'str', 'bool': 'bool', 'double': 'float',
                'float': 'float'}
RESULT_CONVERTER_TYPES = {'PyLong_FromLong': 'int', 'PyLong_FromSize_t': 'int',
                          'PyBool_FromLong': 'bool', 'PyFloat_FromDouble': 'float',
                          'swigrt::FromChar': 'str'}
FORWARD_SCALARS = {'bool': 'bool', 'long': 'int', 'size_t': 'int', 'double': 'float'}


@dataclass(frozen=True)
class ClassRef:
    """A class of one of the proxy modules; module '' is the runtime's wrapped
    pointer, which stands for objects of host types that no module wraps."""
    module: str
    name: str


POINTER_OBJECT = ClassRef('', 'SwigPyObject')


@dataclass(frozen=True)
class Generic:
    """A generic type over Python types: `_Sequence[VPoint | _Sequence[float]]`.
    A name with a leading '_' is a stub-only protocol of the package, shown
    without it in documentation."""
    name: str
    args: tuple


def _option(o, home: str, stub: bool) -> str:
    if isinstance(o, str):
        return o
    if isinstance(o, Generic):
        name = o.name if stub else o.name.lstrip('_')
        return f'{name}[{", ".join(a.render(home, stub) for a in o.args)}]'
    if not o.module:
        return '_' + o.name if stub else o.name
    if o.module == home:
        return o.name
    return f'{o.module}.{o.name}'


@dataclass(frozen=True)
class PyType:
    """A union of Python types: names of built-in types and typing forms,
    and classes of the modules."""
    options: tuple

    def render(self, home: str, stub: bool = False) -> str:
        """The annotation written in the proxy module `home` (or its stub: the
        wrapped pointer is a stub-only class of the package there)."""
        return ' | '.join(_option(o, home, stub) for o in self.options)

    @property
    def modules(self) -> set[str]:
        out = set()
        for o in self.options:
            if isinstance(o, ClassRef):
                out.add(o.module)
            elif isinstance(o, Generic):
                out |= {o.name} if o.name.startswith('_') else set()
                for a in o.args:
                    out |= a.modules
        return out

    def __or__(self, other: 'PyType') -> 'PyType':
        return PyType(self.options + tuple(o for o in other.options if o not in self.options))


def of(*options) -> PyType:
    return PyType(tuple(options))


NONE, ANY, OBJECT = of('None'), of('Any'), of('object')
STR, INT, FLOAT, BOOL = of('str'), of('int'), of('float'), of('bool')
STR_LIST = of('list[str]')
STATUS = of("Literal['unknown']", 'None')


@dataclass
class PyParam:
    name: str
    type: PyType
    default: str | None = None   # a Python literal, or '...' for a value Python
                                 # cannot spell; None when the argument is required


@dataclass
class PySignature:
    name: str
    params: list[PyParam]
    result: PyType

    def text_signature(self) -> str:
        """__text_signature__ of a method taking its arguments by position."""
        params = ['$self'] + [p.name if p.default is None else f'{p.name}={p.default}'
                              for p in self.params]
        return f'({", ".join(params + ["/"])})'

    def describe(self, home: str) -> str:
        """name(param: type, ...) -> result, as documentation shows it."""
        params = ', '.join(f'{p.name}: {p.type.render(home)}' +
                           ('' if p.default is None else f' = {p.default}') for p in self.params)
        return f'{self.name}({params}) -> {self.result.render(home)}'

    @property
    def types(self) -> list[PyType]:
        return [p.type for p in self.params] + [self.result]


@dataclass
class TypeScope:
    """What the types of one module can name: the classes of every module
    sharing its type table, by descriptor, and the pointer classes that stand
    for a scalar a host member reads or writes through a pointer."""
    home: str
    classes: dict[str, ClassRef] = field(default_factory=dict)
    pointer_elements: dict[str, ClassRef] = field(default_factory=dict)
    enumerators: dict[str, int] = field(default_factory=dict)   # "Class::kName" -> value
    # The Python sequences that stand for a class's objects, and the sequence
    # each class with a shape is itself, by class name.
    sequences: dict[str, PyType] = field(default_factory=dict)
    shapes: dict[str, PyType] = field(default_factory=dict)

    def add_module(self, proxy: str, classes: list[str], pointer_classes: list[tuple[str, str]]):
        for name in classes:
            self.classes[pointer_descriptor_name(CType('record', name))[0]] = ClassRef(proxy, name)
        for name, element in pointer_classes:
            self.classes[pointer_descriptor_name(CType('record', name))[0]] = ClassRef(proxy, name)
            key = pointer_descriptor_name(CType('builtin', element))[0]
            self.pointer_elements[key] = ClassRef(proxy, name)

    def object(self, descriptor, taken: bool) -> PyType:
        """An object of the descriptor's type; `taken`: what an argument
        accepts, where a pointer class also stands for its scalar."""
        if descriptor is None:
            return ANY
        cls = self.classes.get(descriptor.name)
        if cls is not None:
            return of(cls)
        cell = self.pointer_elements.get(descriptor.name) if taken else None
        return of(cell, POINTER_OBJECT) if cell else of(POINTER_OBJECT)

    # --- what Python passes and gets back ----------------------------------------

    def arg(self, a) -> PyType:
        if a.kind == 'scalar':
            return INT if a.cast else of(SCALAR_TYPES[a.cpp])
        if a.kind == 'object':
            t = self.object(a.descriptor, True)
            if a.numbers:   # nested sequences of numbers of its dimensions
                nested = of(SCALAR_TYPES[a.numbers[0]])
                for _ in a.shape:
                    nested = of(Generic('_Sequence', (nested,)))
                t = t | nested
            elif a.sequence:
                t = t | self.sequences.get(a.value_type, ANY)
            return t if a.reference or t == ANY else t | NONE
        if a.kind == 'string':
            return STR
        if a.kind == 'string_array':
            return STR_LIST if a.output else of('list[str]', 'tuple[str, ...]')
        if a.kind == 'string_ptr':
            return STR | NONE
        if a.kind == 'chars':
            cell = self.pointer_elements.get('_p_char')
            return STR | (of(cell) if cell else NONE) | NONE
        if a.kind == 'callable':
            t = of('Callable[..., Any]')
            return t | NONE if a.optional else t
        return ANY      # a Python object passed through

    def result(self, r) -> PyType:
        if r.kind == 'void':
            return NONE
        if r.kind == 'status':
            return STATUS
        if r.kind == 'scalar':
            return of(RESULT_CONVERTER_TYPES[r.converter])
        if r.kind == 'chars':
            return STR | NONE
        if r.kind == 'string':
            return STR
        if r.kind == 'string_array':
            return STR_LIST
        t = self.object(r.descriptor, False)
        return t | NONE if r.kind == 'pointer' else t

    def forward_arg(self, a) -> PyType:
        if a.kind in FORWARD_SCALARS:
            return of(FORWARD_SCALARS[a.kind])
        if a.kind == 'string':
            return STR
        if a.kind == 'string_array':
            return STR_LIST
        if a.kind == 'chars':
            return STR | NONE
        t = self.object(a.descriptor, False)
        return t | NONE if a.pointer else t

    def forward_result(self, r) -> PyType:
        if r.kind in ('void', 'status'):
            return NONE if r.kind == 'void' else STATUS
        if r.kind == 'bool':
            return BOOL
        if r.kind == 'scalar':
            return of(SCALAR_TYPES.get(r.target, 'int'))
        if r.kind in ('chars', 'string'):
            return STR
        if r.kind == 'string_array':
            return STR_LIST
        t = self.object(r.descriptor, False)
        return t | NONE if r.kind == 'pointer' else t

    # --- signatures ---------------------------------------------------------------

    def default(self, a) -> str:
        """The Python value of a C++ default argument, or '...'."""
        text = a.default
        if text == 'nullptr':
            return 'None'
        if text.startswith('"') and text.endswith('"'):
            raw = codecs.escape_decode(text[1:-1].encode())[0]
            return repr(raw.decode('utf-8', 'surrogateescape'))
        if text in ('true', 'false'):
            return 'True' if text == 'true' else 'False'
        if text in self.enumerators:
            return str(self.enumerators[text])
        number = re.fullmatch(r'(-?\d+(\.\d*)?([eE]-?\d+)?)[fFuUlL]*', text)
        if number is None:
            return '...'
        value = ast.literal_eval(number.group(1))
        if a.kind == 'scalar' and a.cpp == 'bool':
            return repr(bool(value))
        if a.kind == 'scalar' and a.cpp in ('double', 'float'):
            return repr(float(value))
        return repr(value)

    def signature(self, name: str, cand, comparison: bool = False) -> PySignature:
        params = [PyParam(python_name(a.name), self.arg(a),
                          self.default(a) if a.optional else None)
                  for a in cand.args if a.slot is not None and not a.is_self]
        if comparison:   # an operand that does not convert compares unequal
            params[0].type = OBJECT
        result = self.result(cand.result)
        outputs = [of(_nested_list(SCALAR_TYPES[a.cpp], len(a.shape)))
                   for a in cand.args if a.kind == 'array_out']
        if outputs:
            # The arrays the host fills replace a status or nothing, and
            # follow any other result.
            if cand.result.kind not in ('void', 'status'):
                outputs.insert(0, result)
            result = outputs[0] if len(outputs) == 1 else of(
                f'tuple[{", ".join(t.render(self.home, True) for t in outputs)}]')
        return PySignature(name, params, result)

    def pointer_class(self, p) -> list[tuple[PySignature, bool]]:
        """The members of a pointer class, with whether each is static."""
        own = of(ClassRef(self.home, p.name))
        cell = of(SCALAR_TYPES[p.element])
        return [(PySignature('assign', [PyParam('value', cell)], NONE), False),
                (PySignature('value', [], cell), False),
                (PySignature('cast', [], of(POINTER_OBJECT)), False),
                (PySignature('frompointer', [PyParam('pointer', own | of(POINTER_OBJECT))], own),
                 True)]

    def forward_signature(self, f) -> PySignature:
        params = [PyParam(python_name(a.name), self.forward_arg(a))
                  for a in f.args if a.kind != 'status_out']
        return PySignature(f.name, params, self.forward_result(f.result))


# What else a Python type takes, as type checkers see it.
_TAKES = {'int': {'bool'}, 'float': {'int', 'bool'}}


def _covers(a: PyType, b: PyType, shapes: dict | None = None) -> bool:
    """Whether `a` takes everything `b` does. `shapes` gives the sequence a
    class of the modules is (a point is a sequence of float), since a type
    checker sees it as one."""
    return all(_covers_option(a, o, shapes or {}) for o in b.options)


def _covers_option(a: PyType, o, shapes: dict) -> bool:
    if o in a.options:
        return True
    if isinstance(o, str):
        return any(isinstance(t, str) and o in _TAKES.get(t, ()) for t in a.options)
    if isinstance(o, ClassRef) and o.name in shapes:
        return _covers(a, shapes[o.name], shapes)
    if isinstance(o, Generic):
        return any(isinstance(t, Generic) and t.name == o.name and len(t.args) == len(o.args)
                   and all(_covers(x, y, shapes) for x, y in zip(t.args, o.args))
                   for t in a.options)
    return False


def distinct_forms(sigs: list[PySignature], shapes: dict | None = None) -> list[PySignature]:
    """The forms of an overloaded member as Python tells them apart: a form
    whose every call an earlier one also takes (`int` after `int`, or `str`
    after `str | None`, or a point after a sequence of numbers) is left out."""
    out: list[PySignature] = []
    for sig in sigs:
        if not any(len(f.params) == len(sig.params) and
                   all((p.default is None) == (q.default is None) and
                       _covers(p.type, q.type, shapes)
                       for p, q in zip(f.params, sig.params)) for f in out):
            out.append(sig)
    return out


def _nested_list(element: str, depth: int) -> str:
    return 'list[' * depth + element + ']' * depth


def python_name(name: str) -> str:
    """A parameter's Python name: its C++ name, with a trailing '_' where that
    is a keyword or `self`."""
    return name + '_' if keyword.iskeyword(name) or name == 'self' else name
