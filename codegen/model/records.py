"""The model's records: what a generated module consists of. Filled by the
builder, read by the emitters."""
from __future__ import annotations

import dataclasses
import hashlib
import struct
from typing import TYPE_CHECKING
from dataclasses import dataclass, field

from .pytypes import PySignature, PyType

if TYPE_CHECKING:
    from .protocols import Protocols

METH_VARARGS = 1
METH_NOARGS = 4
METH_O = 8
METH_FASTCALL = 0x80   # the arguments as an array: the special methods of values


@dataclass
class Cast:
    source: 'Descriptor'
    converter: str                  # C function converting a source pointer
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
    """One C++ parameter of a concrete wrapper and how it is filled.

    kind: scalar, object (a wrapped pointer), string, string_array, string_ptr
    (an optional `VString const *`), chars (`char const *`), status_out (a
    `VStatus *` the wrapper owns), pyobject (passed through), callable (a
    Python object standing for a function pointer, referenced and announced),
    array_out (an array of numbers the host fills, returned as nested lists)."""
    number: int                  # position in messages, counted from 1 with self
    slot: int | None             # index in the Python arguments; None when not from Python
    spelling: str
    kind: str
    cpp: str = ''                # scalar: the local's type; object: the pointer type
    message: str = ''
    descriptor: Descriptor | None = None
    reference: bool = False      # object: a null pointer is refused
    null_message: str | None = None
    converter: str = ''          # scalar: the convert/ routine
    cast: str | None = None      # scalar: the enumeration the local is cast to
    default: str | None = None   # the C++ value when the argument is absent
    output: bool = False         # string_array: the list is rewritten after the call
    list_messages: tuple[str, str] = ('', '')   # not a list, cannot modify
    is_self: bool = False        # `self` of a member call
    announce: str = ''           # callable: the host function announcing it
    disown: bool = False         # object: the wrapper gives its object up to the host
    array: bool = False          # object: an array, passed as the pointer to its first
                                 # element, null refused like a reference
    name: str = ''               # the parameter's name in the header
    strict: bool = False         # string kinds: a wrong one stops the call
    # object: a Python sequence of the class's shape stands for the object,
    # read by this function (`SequenceTo_VPoint`) into a local of `value_type`
    sequence: str = ''
    value_type: str = ''
    shape: tuple = ()            # array_out, and an object that is an array of
                                 # numbers read from nested sequences: its dimensions
    # the element of an array of numbers read from nested sequences:
    # (C++ type, convert/ routine)
    numbers: tuple[str, str] | None = None
    array_of: tuple | None = None   # an array of numbers: (element, dimensions)

    @property
    def optional(self) -> bool:
        return self.default is not None


@dataclass
class Result:
    """How the C++ result becomes the Python result.

    kind: void, status, scalar, chars, string, string_array, value (copied and
    owned), pointer, reference."""
    kind: str
    cpp: str = ''                # the C++ type of the local holding the result
    converter: str = ''          # scalar: the Python constructor
    descriptor: Descriptor | None = None
    # A member's pointer or reference: lent by the object the member was
    # called on, which the result keeps alive; of the member's own class, it
    # may be that object itself (`return *this`), which the call then gives
    # back.
    lent: bool = False
    may_be_self: bool = False


@dataclass
class Candidate:
    """One C++ signature behind an entry point."""
    function: str
    prototype: str
    min_args: int
    max_args: int
    args: list[Arg]              # every C++ parameter, self first for members
    result: Result
    call: str                    # "new VPxNode", or the member's name
    static: bool = False
    const: bool = False
    virtual: bool = False        # may be carried out by a Python override
    pure: bool = False
    protected: bool = False
    owner: str = ''              # the class that declares the member
    doc: str = ''                # the header's comment on the declaration
    python: 'PySignature | None' = None   # as Python calls it
    # An operator: member (self.operator@(other)), free (operator@(self,
    # other)), reflected (operator@(other, self)), commuted (self.operator@(
    # other) for other @ self), call (self(indices...) within the bounds).
    operator: str = ''


@dataclass
class DispatchRule:
    counts: tuple[int, int]       # argc range this rule covers
    candidates: list[Candidate]   # tried in order; the last one unconditionally
    tests: list[Arg | None] = field(default_factory=list)  # check-only conversion per candidate


@dataclass
class EntryPoint:
    """One Python-callable function and the candidates behind it."""
    entry: str                    # "new_VPxNode", "VPxNode_compute"
    function: str
    flags: int
    candidates: list[Candidate]
    dispatch: list[DispatchRule] = field(default_factory=list)
    max_args: int = 0
    message: str = ''             # the overload message, when there is a dispatcher
    member: str = ''              # the Python method name; empty for constructors
    static: bool = False
    takes_self: bool = False      # constructors: argument 1 is the Python object
    refuse_plain: bool = False    # constructors: no plain object may be built
    comparison: bool = False      # == or !=: an operand that does not convert is
                                  # not an error but NotImplemented
    field: str = ''               # data member accessors: the member's name
    accessor: str = ''            # 'get' or 'set' for a data member accessor
    doc: str = ''                 # __doc__ of the proxy's member
    # The forms Python tells apart (`field` above is a member's name here).
    forms: list['PySignature'] = dataclasses.field(default_factory=list)
    text_signature: str | None = None   # its __text_signature__, when it has one form
    # A special method of Python's data model the class has as a value (see
    # protocols.py): operator, unary, call, len, getitem, setitem, iter, repr,
    # hash, str, text_eq, text_ne.
    protocol: str = ''
    self_arg: Arg | None = None   # `self` of a protocol without candidates

    @property
    def converts_objects(self) -> bool:
        """Whether a candidate converts a wrapped object (self included), whose
        "this" a call scope may have to keep alive until the call is over."""
        return any(a.kind == 'object' for c in self.candidates for a in c.args) or \
            self.takes_self or self.comparison


@dataclass
class Constant:
    name: str
    value: int | float | str
    cpp: str = ''                 # the enumerator or macro, "VPxNode::kDependNode"
    make: str = ''                # the call making a number's Python value, when not a long


@dataclass
class GlobalVariable:
    name: str                     # Python name, "VPxNode_message"
    cpp: str                      # "VPxNode::message"
    spelling: str                 # the value type, "VObject"
    descriptor: Descriptor
    readonly: bool
    doc: str = ''
    python: 'PyType | None' = None

    @property
    def message(self) -> str:
        if self.readonly:
            return f'Variable {self.name} is read-only.'
        return f"in variable '{self.cpp}' of type '{self.spelling}'"

    @property
    def null_message(self) -> str:
        return 'invalid null reference ' + self.message


@dataclass
class PointerClass:
    """A heap cell of one scalar that Python can make, read, write and pass."""
    name: str                     # "intPtr"
    element: str                  # "int"
    descriptor: Descriptor        # _p_intPtr
    element_descriptor: Descriptor  # _p_int
    converter: str                # the convert/ routine for assign
    result: str                   # how value() converts
    # assign, value, cast and frompointer as Python calls them; frompointer static
    python: list[tuple['PySignature', bool]] = field(default_factory=list)

    def entry(self, what: str) -> str:
        return {'new': f'new_{self.name}', 'delete': f'delete_{self.name}'}.get(
            what, f'{self.name}_{what}')


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
    constructor: EntryPoint | None
    members: list[EntryPoint]
    constants: list[Constant]
    variables: list[GlobalVariable]
    director_class: 'DirectorClass | None' = None
    comment: str = ''             # the header's comment on the class
    doc: str = ''                 # __doc__ of the proxy class
    protocols: 'Protocols | None' = None   # with the module's value protocols

    @property
    def delete_entry(self) -> str:
        return f'delete_{self.name}'


@dataclass
class MethodEntry:
    name: str
    function: str
    flags: int
    # Generated functions catch C++ exceptions themselves; the method table
    # wraps the others (hand-written ones among them) in swigrt::Safe.
    catches: bool = False


@dataclass
class Module:
    name: str                     # "_OpenVorlaVPx"
    proxy: str                    # "OpenVorlaVPx"
    source: str                   # manifest path, for banners
    namespace: str
    headers: list[str]
    imports: list[str]
    pointer_classes: list[PointerClass]
    classes: list[WrappedClass]
    descriptors: list[Descriptor]
    entries: list[MethodEntry]
    start_constants: list[Constant]
    installs: list[Constant | GlobalVariable]
    api_version: str
    functions: list[MethodEntry] = field(default_factory=list)   # hand-written free functions
    resources: list[tuple[str, str]] = field(default_factory=list)  # (table, key), in order
    value_protocols: bool = False  # its classes are Python values (see protocols.py)
    strict_scalars: bool = False

    @property
    def directors(self) -> list['DirectorClass']:
        return [c.director_class for c in self.classes if c.director_class]

    @property
    def director_families(self) -> dict[str, list[WrappedClass]]:
        return {f: cs for f, cs in self.families.items() if any(c.director_class for c in cs)}

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


@dataclass
class ForwardArg:
    """One C++ argument of a forwarding override, made into a Python object.

    kind: borrowed (a wrapped pointer, not owned), director (the object's own
    Python instance when it is a director), copied (a heap copy Python owns),
    string, string_array, chars, bool, long, size_t, double; status_out (not
    passed: filled with the call's success)."""
    name: str                     # the override's parameter name
    cpp: str                      # its declared type
    kind: str
    descriptor: Descriptor | None = None
    pointer: bool = False         # borrowed/director: the parameter is a pointer
    value_type: str = ''          # copied: the class copied
    type: object = None           # the declared CType, for tools that call overrides
    python: 'PyType | None' = None   # what the Python method receives


@dataclass
class ForwardResult:
    """How the Python result becomes the override's C++ result.

    kind: void, status, bool, scalar, value, reference, pointer, chars,
    string, string_array."""
    kind: str
    cpp: str = ''                 # the override's result type
    target: str = ''              # value/reference/pointer: the class; scalar: the local type
    converter: str = ''           # scalar: the convert/ routine
    descriptor: Descriptor | None = None
    message: str = ''
    null_message: str = ''
    python: 'PyType | None' = None   # what the Python method is to return


@dataclass
class Forward:
    """One forwarding override of a director class."""
    name: str
    owner: str                    # the class that declares the implementation
    args: list[ForwardArg]
    result: ForwardResult
    const: bool
    protected: bool
    pure: bool
    arity: bool                   # tested against the Python method's signature
    doc: str = ''                 # the header's comment on the declaration
    python: 'PySignature | None' = None   # as the application calls the Python method
    returns: str = ''             # what the Python method is to return, in words

    @property
    def qualified(self) -> str:
        return f'{self.owner}::{self.name}'


@dataclass
class DirectorClass:
    cls: str
    constructors: list[list[tuple[str, str]]]   # (type, name) per parameter, per constructor
    forwards: list[Forward]
    companions: list['Companion']  # protected members reached through <m>SwigPublic

    @property
    def name(self) -> str:
        return f'SwigDirector_{self.cls}'

    @property
    def function_count(self) -> int:
        """The functions the director class itself defines: one constructor per
        constructor of its class, the destructor, the forwarding overrides and
        the SwigPublic companions of the protected members it inherits or
        declares. The inner-table overrides are the director base's and are
        not counted."""
        return len(self.constructors) + 1 + len(self.forwards) + len(self.companions)

    @property
    def uninitialized(self) -> str:
        return f"'self' uninitialized, maybe you forgot to call {self.cls}.__init__."


@dataclass
class Companion:
    """A protected member made callable from its entry point: <m>SwigPublic."""
    name: str
    owner: str
    params: list[tuple[str, str]]  # (type, name)
    result: str
    const: bool
    pure: bool
