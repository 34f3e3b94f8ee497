"""How each C++ parameter is filled from Python and how each C++ result
becomes a Python object, with the fixed message texts of each argument."""
from __future__ import annotations

import re
from typing import Callable

from ..parse import CType, Param
from .records import Arg, Descriptor, ForwardArg, ForwardResult, Result
from .naming import GeneratorError, spell, unqualified

# Scalar parameter types and the routine that converts each.
SCALAR_CONVERTERS = {'int': 'AsInt', 'unsigned int': 'AsUnsignedInt', 'short': 'AsShort',
                     'unsigned char': 'AsUnsignedChar', 'char': 'AsChar', 'bool': 'AsBool',
                     'double': 'AsDouble', 'float': 'AsFloat'}
# The same where scalars are strict: a boolean is a bool, and a number is
# anything Python's number protocols make one of (numpy's scalars among them).
STRICT_CONVERTERS = {'int': 'AsNumberInt', 'unsigned int': 'AsNumberUnsignedInt',
                     'short': 'AsNumberShort', 'unsigned char': 'AsNumberUnsignedChar',
                     'char': 'AsChar', 'bool': 'AsStrictBool', 'double': 'AsNumberDouble',
                     'float': 'AsNumberFloat'}
# Scalar result types and the call that makes their Python value.
SCALAR_RESULTS = {'int': 'PyLong_FromLong', 'short': 'PyLong_FromLong',
                  'unsigned char': 'PyLong_FromLong', 'unsigned int': 'PyLong_FromSize_t',
                  'bool': 'PyBool_FromLong', 'double': 'PyFloat_FromDouble',
                  'float': 'PyFloat_FromDouble', 'char': 'swigrt::FromChar'}
# Host types converted by the scripting engine rather than wrapped.
STRING, STRING_ARRAY, STATUS = 'VString', 'VStringArray', 'VStatus'
PYOBJECT = ('PyObject', '_object')

_NULL_DEFAULTS = frozenset({'0', 'NULL', 'nullptr'})
_LITERAL = re.compile(r'-?(\d+(\.\d*)?([eE]-?\d+)?[fFuUlL]*|true|false)')

DescriptorFor = Callable[[CType], Descriptor]


def constant_number(t: CType) -> str:
    """The call making the Python number of a constant of this type, or ''."""
    t = _scalar_target(t)
    if not t.const or t.kind != 'builtin' or t.name not in SCALAR_RESULTS:
        return ''
    return SCALAR_RESULTS[t.name]


def _scalar_target(t: CType) -> CType:
    """A typedef of a scalar or enumeration converts as what it names."""
    while t.kind == 'typedef' and t.inner.kind in ('builtin', 'enum', 'typedef'):
        t = CType(t.inner.kind, t.inner.name, t.const or t.inner.const, t.inner.inner)
    return t


def _is(t: CType, kind: str, name: str | None = None) -> bool:
    return t.kind == kind and (name is None or t.name == name)


def _scalar_default(t: CType, text: str, scope: str = '') -> str | None:
    """A default argument usable outside the class: a literal, or an
    enumerator qualified by its enumeration's scope (or, for a plain number,
    by the class whose member it is)."""
    if _LITERAL.fullmatch(text):
        return text
    if t.kind == 'builtin' and scope and re.fullmatch(r'[A-Za-z_]\w*', text):
        return f'{scope}::{text}'
    if t.kind == 'enum' and re.fullmatch(r'[A-Za-z_]\w*', text):
        scope = t.name.rpartition('::')[0]
        return f'{scope}::{text}' if scope else text
    if t.kind == 'enum' and re.fullmatch(r'[A-Za-z_][\w:]*', text):
        return text
    return None


def _function_pointer(t: CType) -> bool:
    while t.kind == 'typedef':
        t = t.inner
    return t.kind == 'pointer' and t.inner.kind == 'function'


def scalar_converter(name: str, strict: bool) -> str:
    return (STRICT_CONVERTERS if strict else SCALAR_CONVERTERS)[name]


def argument(number: int, slot: int | None, p: Param, entry: str,
             descriptor_for: DescriptorFor, announce: str = '', scope: str = '',
             strict: bool = False, outputs: bool = False) -> Arg:
    """How parameter `p`, argument `number` of `entry`, is filled. Where
    scalars are `strict`, a string argument that does not convert stops the
    call with the argument's message, as a wrapped object's does. With
    `outputs`, a writable array of numbers is the host's to fill, and Python
    gets it back with the result."""
    t = p.type
    declared = spell(t)
    numbers = number_array(t)
    if outputs and numbers and not _innermost(t).const:
        return Arg(number, None, declared, 'array_out', numbers[0], shape=numbers[1],
                   converter=SCALAR_RESULTS[numbers[0]], name=p.name)
    # An array parameter is a pointer to its first element, which the host
    # reads: a null one is refused as a null reference is.
    array = t.kind == 'array'
    if array:
        t = CType('pointer', inner=t.inner)
    inner = t.inner if t.kind in ('pointer', 'lvref') else None
    method = f"in method '{entry}', argument {number} of type "

    def unsupported():
        return GeneratorError(f'{entry}: parameter {p.name or number} of type {spell(t)} '
                              'has no conversion')

    def null_default() -> str | None:
        if p.default is None:
            return None
        if p.default not in _NULL_DEFAULTS:
            raise unsupported()
        return 'nullptr'

    scalar = _scalar_target(t)
    if _function_pointer(t):
        if not announce:
            raise unsupported()
        if p.default is not None and p.default not in _NULL_DEFAULTS:
            raise unsupported()
        return Arg(number, slot, declared, 'callable', declared,
                   default='nullptr' if p.default is not None else None, announce=announce)
    if scalar.kind == 'enum' or (scalar.kind == 'builtin' and scalar.name in SCALAR_CONVERTERS):
        s = spell(unqualified(t))
        default = None
        if p.default is not None:
            default = _scalar_default(scalar, p.default, scope)
            if default is None:
                raise unsupported()
        if scalar.kind == 'enum':
            return Arg(number, slot, s, 'scalar', 'int', method + f"'{s}'",
                       converter=scalar_converter('int', strict), cast=scalar.name,
                       default=default)
        return Arg(number, slot, s, 'scalar', scalar.name, method + f"'{s}'",
                   converter=scalar_converter(scalar.name, strict), default=default)

    string_like = t if t.kind == 'record' else inner if t.kind == 'lvref' else None
    if string_like is not None and string_like.kind == 'record' and \
            string_like.name in (STRING, STRING_ARRAY):
        output = t.kind == 'lvref' and not string_like.const
        if p.default is not None and (output or string_like.name != STRING):
            raise unsupported()
        if string_like.name == STRING:
            if output:
                raise unsupported()
            default = None
            if p.default is not None:
                # A literal, or a static of the member's class.
                default = p.default if p.default.startswith('"') else (
                    p.default if '::' in p.default or not scope else f'{scope}::{p.default}')
            return Arg(number, slot, spell(t), 'string', default=default, strict=strict,
                       message=method + f"'{spell(t)}'" if strict else
                       f'Expected a String or Unicode object for argument {number}')
        return Arg(number, slot, spell(t), 'string_array', strict=strict,
                   message=method + f"'{spell(t)}'" if strict else
                   f'Expected a list of Strings or Unicode objects for argument {number}',
                   output=output,
                   list_messages=(f'Argument {number} must be a list object',
                                  f'Unable to modify argument {number} to return results'))

    if t.kind == 'pointer':
        # Every pointer parameter has its descriptor, whatever fills it.
        descriptor_for(inner)
    if t.kind == 'pointer' and inner.kind == 'record' and inner.name == STRING:
        return Arg(number, slot, spell(t), 'string_ptr', default=null_default(), strict=strict,
                   message=method + f"'{spell(t)}'" if strict else
                   f'Expected a String or Unicode object for argument {number}')
    if t.kind == 'pointer' and _is(inner, 'builtin', 'char'):
        default = p.default
        if default is not None and default not in _NULL_DEFAULTS and \
                not (default.startswith('"') and default.endswith('"')):
            raise unsupported()
        if default in _NULL_DEFAULTS:
            default = 'nullptr'
        return Arg(number, slot, spell(t), 'chars', message=method + f"'{spell(t)}'",
                   default=default)
    if t.kind == 'pointer' and _is(inner, 'record', STATUS):
        return Arg(number, None, spell(t), 'status_out')
    if t.kind == 'pointer' and inner.name in PYOBJECT:
        return Arg(number, slot, spell(t), 'pyobject', default=null_default())

    target = inner if inner is not None else t if t.kind == 'record' else None
    if t.kind == 'pointer' and _is(target, 'builtin', 'void'):
        # `void *` takes a wrapped pointer of any type.
        return Arg(number, slot, declared, 'object', 'void *', method + f"'{declared}'",
                   default=null_default())
    if target is None or target.kind not in ('record', 'typedef', 'builtin', 'array') or \
            target.kind == 'builtin' and target.name == 'void':
        raise unsupported()
    s = declared
    ref = t.kind != 'pointer' or array
    default = None if ref else null_default()
    if ref and p.default is not None:
        raise unsupported()
    return Arg(number, slot, s, 'object', spell(CType('pointer', inner=target)), method + f"'{s}'",
               descriptor=descriptor_for(target), reference=ref,
               null_message=f"invalid null reference {method}'{s}'" if ref else None,
               default=default, array=array, array_of=numbers if array else None)


def _innermost(t: CType) -> CType:
    while t.kind == 'array':
        t = t.inner
    return t


def _dims(t: CType) -> tuple[int, ...]:
    dims = []
    while t.kind == 'array':
        dims.append(t.size)
        t = t.inner
    return tuple(dims)


def number_array(t: CType) -> tuple[str, tuple[int, ...]] | None:
    """The element type and the dimensions of an array of numbers
    (`double [4][4]`), or None."""
    if t.kind != 'array':
        return None
    element = _scalar_target(_innermost(t))
    if element.kind != 'builtin' or element.name not in SCALAR_RESULTS or element.name == 'char':
        return None
    return element.name, _dims(t)


def self_argument(cls: str, entry: str, const: bool, descriptor: Descriptor) -> Arg:
    """`self` of a member call. A null `self` is refused like a null reference,
    since calling a member on it could only crash."""
    s = f'{cls} const *' if const else f'{cls} *'
    message = f"in method '{entry}', argument 1 of type '{s}'"
    return Arg(1, 0, s, 'object', f'{cls} *', message, descriptor=descriptor, reference=True,
               null_message='invalid null reference ' + message, is_self=True)


def result(t: CType, where: str, descriptor_for: DescriptorFor) -> Result:
    if _is(t, 'builtin', 'void'):
        return Result('void')
    scalar = _scalar_target(t)
    if scalar.kind == 'enum':
        return Result('scalar', 'long', 'PyLong_FromLong')
    if scalar.kind == 'builtin' and scalar.name in SCALAR_RESULTS:
        return Result('scalar', scalar.name, SCALAR_RESULTS[scalar.name])
    value = t if t.kind == 'record' else t.inner if t.kind == 'lvref' and t.inner.const else None
    if value is not None and value.kind == 'record':
        if value.name == STATUS and t.kind == 'record':
            return Result('status', STATUS)
        if value.name == STRING:
            return Result('string', STRING)
        if value.name == STRING_ARRAY:
            return Result('string_array', STRING_ARRAY)
    if t.kind == 'pointer' and _is(t.inner, 'builtin', 'char'):
        return Result('chars', 'const char *')
    if t.kind == 'record':
        return Result('value', t.name, descriptor=descriptor_for(t))
    if t.kind in ('pointer', 'lvref') and t.inner.kind in ('record', 'typedef', 'builtin'):
        cpp = spell(unqualified(t.inner))
        return Result('pointer' if t.kind == 'pointer' else 'reference', cpp,
                      descriptor=descriptor_for(t.inner))
    raise GeneratorError(f'{where}: result of type {spell(t)} has no conversion')


def field_result(t: CType, where: str, descriptor_for: DescriptorFor) -> Result:
    """A data member read from Python: a member of class type is lent in
    place, never copied; anything else converts as a result would."""
    if t.kind == 'record' and t.name not in (STRING, STRING_ARRAY, STATUS):
        return Result('reference', spell(unqualified(t)), descriptor=descriptor_for(t))
    return result(t, where, descriptor_for)


# --- the host calling Python: forwarding overrides ------------------------------

def forward_argument(p: Param, index: int, directors: set[str],
                     descriptor_for: DescriptorFor) -> ForwardArg:
    t = p.type
    name = p.name or f'arg{index}'
    cpp = spell(t)
    scalar = _scalar_target(t)
    if scalar.kind == 'enum' or (scalar.kind == 'builtin' and scalar.name in SCALAR_CONVERTERS):
        kind = {'bool': 'bool', 'unsigned int': 'size_t', 'double': 'double',
                'float': 'double'}.get(scalar.name, 'long')
        return ForwardArg(name, cpp, kind)
    value = t if t.kind == 'record' else t.inner if t.kind == 'lvref' else None
    if value is not None and value.kind == 'record' and value.name in (STRING, STRING_ARRAY):
        return ForwardArg(name, cpp, 'string' if value.name == STRING else 'string_array')
    if t.kind == 'pointer' and _is(t.inner, 'builtin', 'char'):
        return ForwardArg(name, cpp, 'chars')
    if t.kind == 'pointer' and _is(t.inner, 'record', STATUS):
        # The Python method has the signature its entry point has, which takes
        # no status output: the override reports failure by raising.
        return ForwardArg(name, cpp, 'status_out')
    if t.kind == 'record':
        return ForwardArg(name, cpp, 'copied', descriptor_for(t), value_type=t.name)
    if t.kind in ('pointer', 'lvref') and t.inner.kind in ('record', 'typedef', 'builtin'):
        kind = 'director' if t.inner.kind == 'record' and t.inner.name in directors else 'borrowed'
        return ForwardArg(name, cpp, kind, descriptor_for(t.inner), pointer=t.kind == 'pointer',
                          value_type=spell(unqualified(t.inner)))
    raise GeneratorError(f'argument {name} of type {cpp} cannot be passed to Python')


def forward_result(t: CType, where: str, descriptor_for: DescriptorFor) -> ForwardResult:
    cpp = spell(t)
    message = f"in output value of type '{cpp}'"
    if _is(t, 'builtin', 'void'):
        return ForwardResult('void', cpp)
    scalar = _scalar_target(t)
    if scalar.kind == 'enum' or (scalar.kind == 'builtin' and scalar.name in SCALAR_CONVERTERS):
        if scalar.kind == 'builtin' and scalar.name == 'bool':
            return ForwardResult('bool', cpp)
        local = 'int' if scalar.kind == 'enum' else scalar.name
        converter = 'AsInt' if scalar.kind == 'enum' else SCALAR_CONVERTERS[scalar.name]
        return ForwardResult('scalar', cpp, local, converter, message=message)
    if t.kind == 'record' and t.name == STATUS:
        return ForwardResult('status', cpp)
    value = t if t.kind == 'record' else t.inner if t.kind == 'lvref' and t.inner.const else None
    if value is not None and value.kind == 'record' and value.name in (STRING, STRING_ARRAY):
        return ForwardResult('string' if value.name == STRING else 'string_array', cpp)
    if t.kind == 'pointer' and _is(t.inner, 'builtin', 'char'):
        return ForwardResult('chars', cpp, message=message)
    if t.kind == 'record':
        return ForwardResult('value', cpp, t.name, descriptor=descriptor_for(t), message=message)
    if t.kind in ('pointer', 'lvref') and t.inner.kind == 'record':
        kind = 'pointer' if t.kind == 'pointer' else 'reference'
        return ForwardResult(kind, cpp, t.inner.name, descriptor=descriptor_for(t.inner),
                             message=message, null_message='invalid null reference ' + message)
    raise GeneratorError(f'{where}: result of type {cpp} cannot come from Python')
