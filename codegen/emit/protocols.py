"""The entry points of Python's data model for value classes (operators,
subscripts, lengths, reprs, hashes), and the functions reading a sequence into
an object and hashing one; what each does is decided in model/protocols.py."""
from __future__ import annotations

from . import entries as _e
from .common import c_string
from ..model import METH_O, Arg, Candidate, EntryPoint, WrappedClass
from ..model.protocols import Element, Part, Shape, hash_function

_NOT_IMPLEMENTED = ('  // Any other operand is for Python to try the other way round.\n'
                    '  Py_RETURN_NOTIMPLEMENTED;\n')
_INTEGERS = 'integers'
_INDICES = {'grid': ('integers, slices or pairs of integers', 'pairs of integers')}


def _indices(shape: Shape) -> tuple[str, str]:
    """What __getitem__ and __setitem__ take, as their messages say."""
    return _INDICES.get(shape.kind, ('integers or slices', _INTEGERS))


def _indent(text: str) -> str:
    return ''.join(f'  {line}\n' if line else '\n' for line in text.rstrip('\n').split('\n'))


def _number(result: str, value: str) -> str:
    """The Python value of a number, made by the call `result`."""
    if result == 'PyLong_FromLong':
        return f'PyLong_FromLong(static_cast<long>({value}))'
    return f'{result}({value})'


def _maker(e: Element) -> str:
    """A lambda making the Python value of one number of the element's type."""
    return f'[]({e.cpp} v) {{ return {_number(e.result, "v")}; }}'


def _element(e: Element, value: str) -> str:
    """The Python object of an element: a number, or an owned copy of a value."""
    if e.number:
        return _number(e.result, value)
    return (f'swigrt::NewPointerObj(nullptr, new {e.cpp}({value}), {e.descriptor.macro}, '
            'SWIG_POINTER_OWN)')


def _dims(dims: tuple[int, ...]) -> str:
    return '{' + ', '.join(str(d) for d in dims) + '}'


def _count(ep: EntryPoint, count: int) -> str:
    """The arguments of a METH_FASTCALL entry point, counted."""
    return (f'  if (!swigrt::CountArgs({c_string(ep.entry)}, {count}, {count}, nargs)) '
            'return nullptr;\n  PyObject *const *argv = args;\n')


def _self(cls: str, ep: EntryPoint, unpack: int) -> str:
    """Counts the arguments and converts `self`, naming it `self`."""
    if unpack == 1:
        head = '  if (!arg) return nullptr;\n  PyObject *argv[1] = {arg};\n'
    else:
        head = _count(ep, unpack)
    return head + _e._convert(ep.self_arg) + f'  {cls} &self = *static_cast<{cls} *>(argp1);\n'


def _function(ep: EntryPoint, body: str) -> str:
    if ep.flags == METH_O:
        return _e._open(ep.function, 'arg') + body + _e._CLOSE
    head = (f'PyObject *{ep.function}(PyObject *, PyObject *const *args, Py_ssize_t nargs) try {{\n'
            '  swigrt::CallScope scope;\n')
    return head + body + _e._CLOSE


# --- sequences -----------------------------------------------------------------------

def _at(shape: Shape, index: str) -> str:
    return f'static_cast<{shape.index_cpp}>({index})'


def _item(cls: str, shape: Shape) -> str:
    """A lambda making the Python object of item `i`; an array checks its
    length again, since making an object may run Python code that changes it."""
    if shape.kind == 'grid':
        row = _element(shape.element, f'self({_at(shape, "i")}, {_at(shape, "j")})')
        return (f'[&](Py_ssize_t i) {{\n'
                f'    return swigrt::TupleOf({shape.dims[1]}, [&](Py_ssize_t j) {{ return {row}; }});\n'
                '  }')
    value = _element(shape.element, f'self[{_at(shape, "i")}]')
    if shape.kind == 'array':
        return ('[&](Py_ssize_t i) -> PyObject * {\n'
                f'    if (i >= static_cast<Py_ssize_t>(self.{shape.length}())) {{\n'
                f'      PyErr_SetString(PyExc_IndexError, {c_string(cls + " index out of range")});\n'
                '      return nullptr;\n    }\n'
                f'    return {value};\n  }}')
    return f'[&](Py_ssize_t i) {{ return {value}; }}'


def _length(shape: Shape) -> str:
    if shape.kind == 'array':
        return f'static_cast<Py_ssize_t>(self.{shape.length}())'
    return str(shape.size)


def _len(cls: str, ep: EntryPoint, shape: Shape) -> str:
    self = _self(cls, ep, 1)
    if shape.kind != 'array':
        self = self.replace(f'  {cls} &self = *static_cast<{cls} *>(argp1);\n', '')
    return _function(ep, self + f'  return PyLong_FromSsize_t({_length(shape)});\n')


def _getitem(cls: str, ep: EntryPoint, shape: Shape) -> str:
    what = _indices(shape)[0]
    out = _self(cls, ep, 2)
    if shape.kind == 'grid':
        cell = _element(shape.element, f'self({_at(shape, "at[0]")}, {_at(shape, "at[1]")})')
        out += (f'  static const Py_ssize_t dims[] = {_dims(shape.dims)};\n'
                '  if (PyTuple_Check(argv[1])) {\n'
                f'    Py_ssize_t at[{len(shape.dims)}];\n'
                f'    if (!swigrt::GridIndex(argv[1], dims, {len(shape.dims)}, {c_string(cls)}, '
                f'{c_string(what)}, at)) return nullptr;\n'
                f'    return {cell};\n  }}\n')
    out += (f'  return swigrt::GetItem(argv[1], {_length(shape)}, {c_string(cls)}, '
            f'{c_string(what)}, {_item(cls, shape)});\n')
    return _function(ep, out)


def _setitem(cls: str, ep: EntryPoint, shape: Shape) -> str:
    what = _indices(shape)[1]
    out = _self(cls, ep, 3)
    value = _e._value(shape.value)
    if shape.kind == 'grid':
        rank = len(shape.dims)
        out += (f'  static const Py_ssize_t dims[] = {_dims(shape.dims)};\n'
                f'  Py_ssize_t at[{rank}];\n'
                f'  if (!swigrt::GridIndex(argv[1], dims, {rank}, {c_string(cls)}, '
                f'{c_string(what)}, at)) return nullptr;\n' + _e._convert(shape.value) +
                f'  self({_at(shape, "at[0]")}, {_at(shape, "at[1]")}) = {value};\n')
    else:
        # The index is checked against the length only once the value is read:
        # reading it may run Python code that changes the length.
        out += ('  Py_ssize_t i = 0;\n'
                f'  if (!swigrt::IndexOf(argv[1], {c_string(cls)}, {c_string(what)}, &i)) '
                'return nullptr;\n' + _e._convert(shape.value) +
                f'  if (!swigrt::InRange(&i, {_length(shape)}, {c_string(cls)})) return nullptr;\n')
        if shape.assign == 'index':
            out += f'  self[{_at(shape, "i")}] = {value};\n'
        elif shape.checked[1]:
            out += (f'  if (!swigrt::StatusSucceeded(self.set({value}, {_at(shape, "i")}))) '
                    'return nullptr;\n')
        else:
            out += f'  self.set({value}, {_at(shape, "i")});\n'
    return _function(ep, out + '  Py_RETURN_NONE;\n')


def _iter(cls: str, ep: EntryPoint) -> str:
    body = _self(cls, ep, 1).replace(f'  {cls} &self = *static_cast<{cls} *>(argp1);\n', '')
    return _function(ep, body + '  // Items by index until IndexError, as for any sequence.\n'
                            '  return PySeqIter_New(argv[0]);\n')


def _call(cls: str, ep: EntryPoint, shape: Shape) -> str:
    c = ep.candidates[0]
    out = _count(ep, c.max_args) + ''.join(_e._convert(a) for a in c.args)
    indices = [a for a in c.args if not a.is_self]
    bounds = ', '.join(f'static_cast<unsigned long>(arg{a.number})' for a in indices)
    values = ', '.join(_e._value(a) for a in indices)
    out += (f'  static const Py_ssize_t dims[] = {_dims(shape.dims)};\n'
            f'  if (!swigrt::WithinBounds({{{bounds}}}, dims, {c_string(cls)})) return nullptr;\n'
            + _e._result(c, f'static_cast<{cls} *>(argp1)->operator()({values})')
            + '  return resultobj;\n')
    return _function(ep, out)


# --- operators ------------------------------------------------------------------------

def _operation(cls: str, c: Candidate) -> str:
    me = f'*static_cast<{cls} *>(argp1)'
    if len(c.args) == 1:
        return f'static_cast<{cls} *>(argp1)->{c.call}()'
    other = _e._value(c.args[1])
    return {'member': f'static_cast<{cls} *>(argp1)->{c.call}({other})',
            'commuted': f'static_cast<{cls} *>(argp1)->{c.call}({other})',
            'free': f'{c.call}({me}, {other})',
            'reflected': f'{c.call}({other}, {me})'}[c.operator]


def _operator(cls: str, ep: EntryPoint) -> str:
    first = ep.candidates[0]
    if ep.protocol == 'unary':
        return _function(ep, '  if (!arg) return nullptr;\n  PyObject *argv[1] = {arg};\n' +
                         _e._convert(first.args[0]) + _e._result(first, _operation(cls, first)) +
                         '  return resultobj;\n')
    out = _count(ep, 2) + _e._convert(first.args[0])
    for c in ep.candidates:
        out += '  {\n' + _indent(_operand(c.args[1]) + _indent(
            _e._result(c, _operation(cls, c)) + '  return resultobj;\n') + '  }\n') + '  }\n'
    return _function(ep, out + _NOT_IMPLEMENTED)


def _operand(a: Arg) -> str:
    """Converts the other operand once, and opens the block that runs when
    it converts."""
    n = a.number
    if a.kind == 'scalar':
        return (f'  {a.cpp} arg{n}{{}};\n'
                f'  if (SWIG_IsOK(swigrt::{a.converter}(argv[1], &arg{n}))) {{\n')
    if a.kind == 'object':
        return (f'  void *argp{n} = nullptr;\n'
                f'  if (swigrt::OperandPointer(argv[1], {a.descriptor.macro}, &argp{n})) {{\n')
    return (f'  VString arg{n};\n'
            f'  if (swigrt::IsText(argv[1]) && swigrt::StrictStringArg(argv[1], arg{n}, '
            f'{c_string(a.message)})) {{\n')


# --- repr, hash, text -------------------------------------------------------------------

def _part(p: Part) -> str:
    value = f'self.{p.expr}'
    r = p.result
    if r.kind == 'scalar':
        return _number(r.converter, value)
    if r.kind == 'string':
        return f'swigrt::FromString({value})'
    if r.kind == 'chars':
        return f'swigrt::FromCharPtr({value})'
    return f'swigrt::NewPointerObj(nullptr, new {r.cpp}({value}), {r.descriptor.macro}, SWIG_POINTER_OWN)'


def _repr(cls: WrappedClass, ep: EntryPoint) -> str:
    name, p = cls.name, cls.protocols
    shape, form = p.shape, p.repr.form
    out = _self(name, ep, 1)
    if form == 'shape' and shape.kind == 'grid':
        rows, cols = shape.dims
        e = shape.element
        out += (f'  {e.cpp} values[{rows * cols}];\n'
                f'  for ({shape.index_cpp} r = 0; r < {rows}; ++r)\n'
                f'    for ({shape.index_cpp} c = 0; c < {cols}; ++c) values[r * {cols} + c] = '
                'self(r, c);\n'
                f'  swigrt::ValueText text({c_string(name)}, swigrt::ValueText::kCall);\n'
                f'  if (!text.add(swigrt::GridList(values, {_dims(shape.dims)}, {_maker(e)}))) '
                'return nullptr;\n  return text.finish();\n')
    elif form == 'shape':
        out += (f'  return swigrt::ListRepr({c_string(name)}, {_length(shape)}, '
                f'{_item(name, shape)});\n')
    else:
        kind = 'kState' if form == 'state' else 'kCall'
        out += f'  swigrt::ValueText text({c_string(name)}, swigrt::ValueText::{kind});\n'
        if form == 'text':
            out += '  if (!text.add(swigrt::FromString(self))) return nullptr;\n'
        for part in p.repr.parts:
            label = f'{c_string(part.label)}, ' if form == 'state' else ''
            if part.hexadecimal:
                out += (f'  if (!text.addHex({label}static_cast<unsigned long>(self.{part.expr}))) '
                        'return nullptr;\n')
            else:
                out += f'  if (!text.add({label}{_part(part)})) return nullptr;\n'
        out += '  return text.finish();\n'
    return _function(ep, out)


def _hash(cls: WrappedClass, ep: EntryPoint) -> str:
    out = _self(cls.name, ep, 1)
    if cls.protocols.text:
        out += ('  // As its text hashes: it compares equal to it.\n'
                '  PyObject *text = swigrt::FromString(self);\n'
                '  if (!text) return nullptr;\n'
                '  const Py_hash_t hash = PyObject_Hash(text);\n'
                '  Py_DECREF(text);\n'
                '  if (hash == -1) return nullptr;\n'
                '  return PyLong_FromSsize_t(hash);\n')
    else:
        out += f'  return PyLong_FromSsize_t({hash_function(cls.name)}(self));\n'
    return _function(ep, out)


def _text(cls: str, ep: EntryPoint) -> str:
    if ep.protocol == 'str':
        return _function(ep, _self(cls, ep, 1) + '  return swigrt::FromString(self);\n')
    op = '==' if ep.protocol == 'text_eq' else '!='
    return _function(ep, _self(cls, ep, 2) +
                     '  // Anything but text is for Python to compare.\n'
                     '  if (!swigrt::IsText(argv[1])) Py_RETURN_NOTIMPLEMENTED;\n'
                     f'  {cls} other;\n'
                     f'  if (!swigrt::StrictStringArg(argv[1], other, {c_string(ep.message)})) '
                     'return nullptr;\n'
                     f'  return PyBool_FromLong(self {op} other);\n')


def entry_point(cls: WrappedClass, ep: EntryPoint) -> str:
    shape = cls.protocols.shape
    kind = ep.protocol
    if kind in ('operator', 'unary'):
        return _operator(cls.name, ep)
    return {'len': lambda: _len(cls.name, ep, shape),
            'getitem': lambda: _getitem(cls.name, ep, shape),
            'setitem': lambda: _setitem(cls.name, ep, shape),
            'iter': lambda: _iter(cls.name, ep),
            'call': lambda: _call(cls.name, ep, shape),
            'repr': lambda: _repr(cls, ep),
            'hash': lambda: _hash(cls, ep),
            'str': lambda: _text(cls.name, ep),
            'text_eq': lambda: _text(cls.name, ep),
            'text_ne': lambda: _text(cls.name, ep)}[kind]()


# --- functions of the class --------------------------------------------------------------

def declarations(cls: WrappedClass) -> str:
    """What the other families may call: the readers and the hash."""
    p, n = cls.protocols, cls.name
    if p is None:
        return ''
    out = ''
    if p.shape and p.shape.numbers:
        out += f'{n} {p.shape.numbers}(const {p.shape.element.cpp} *v, Py_ssize_t n);\n'
    if p.shape and p.shape.reader:
        out += f'int {p.shape.reader}(PyObject *obj, {n} *out);\n'
    if p.hash is not None and not p.text:
        out += f'Py_hash_t {hash_function(n)}(const {n} &self);\n'
    return out


def _numbers(cls: str, shape: Shape) -> str:
    lo, hi = shape.counts
    e = shape.element.cpp
    cases = []
    for n in range(lo, hi + 1):
        label = 'default' if n == hi else f'case {n}'
        values = ', '.join(f'v[{k}]' for k in range(n))
        cases.append(f'    {label}:\n      return {cls}({values});\n')
    return (f'// A {cls} from {lo} to {hi} numbers, as its constructor takes them.\n'
            f'{cls} {shape.numbers}(const {e} *v, Py_ssize_t n) {{\n'
            '  switch (n) {\n' + ''.join(cases) + '  }\n}\n\n'
            f'int {shape.reader}(PyObject *obj, {cls} *out) {{\n'
            f'  {e} v[{hi}];\n'
            f'  const Py_ssize_t n = swigrt::ReadNumbers(obj, v, {lo}, {hi}, '
            f'swigrt::{shape.element.converter});\n'
            '  if (n < 0) return SWIG_TypeError;\n'
            f'  if (out) *out = {shape.numbers}(v, n);\n'
            '  return SWIG_OK;\n}\n\n')


def _grid_reader(cls: str, shape: Shape) -> str:
    e = shape.element
    cells = ''.join(f'[{d}]' for d in shape.dims)
    first = '[0]' * len(shape.dims)
    return (f'// A {cls} from {" rows of ".join(str(d) for d in shape.dims)} numbers, as its '
            'constructor takes them.\n'
            f'int {shape.reader}(PyObject *obj, {cls} *out) {{\n'
            f'  {e.cpp} v{cells};\n'
            f'  if (!swigrt::ReadGrid(obj, &v{first}, {_dims(shape.dims)}, swigrt::{e.converter}))\n'
            '    return SWIG_TypeError;\n'
            f'  if (out) *out = {cls}(v);\n'
            '  return SWIG_OK;\n}\n\n')


def _append(shape: Shape, value: str) -> str:
    if shape.checked[0]:
        return f'if (out && out->{shape.append}({value}).error()) return SWIG_MemoryError;'
    return f'if (out) out->{shape.append}({value});'


def _array_reader(cls: str, shape: Shape) -> str:
    e = shape.element
    out = (f'// A {cls} from a sequence of its elements.\n'
           f'int {shape.reader}(PyObject *obj, {cls} *out) {{\n')
    if e.numbers:
        lo, hi = e.counts
        out += ('  // Rows of doubles in one buffer (a numpy array) are read without an\n'
                '  // object per number.\n'
                '  swigrt::DoubleBuffer rows(obj, 2);\n'
                '  if (rows) {\n'
                f'    if (rows.dim(1) < {lo} || rows.dim(1) > {hi}) return SWIG_TypeError;\n'
                '    for (Py_ssize_t i = 0; out && i < rows.dim(0); ++i) {\n'
                f'      {_append(shape, f"{e.numbers}(rows.data() + i * rows.dim(1), rows.dim(1))")}\n'
                '    }\n    return SWIG_OK;\n  }\n')
    elif e.number and e.cpp == 'double':
        out += ('  swigrt::DoubleBuffer numbers(obj, 1);\n'
                '  if (numbers) {\n'
                '    for (Py_ssize_t i = 0; out && i < numbers.dim(0); ++i) {\n'
                f'      {_append(shape, "numbers.data()[i]")}\n'
                '    }\n    return SWIG_OK;\n  }\n')
    out += (f'  swigrt::SequenceItems items(obj, std::numeric_limits<{shape.length_cpp}>::max());\n'
            '  if (!items) return items.code();\n'
            '  for (Py_ssize_t i = 0; i < items.size(); ++i) {\n')
    if e.number:
        out += (f'    {e.cpp} element{{}};\n'
                f'    if (!SWIG_IsOK(swigrt::{e.converter}(items[i], &element))) return SWIG_TypeError;\n'
                f'    {_append(shape, "element")}\n')
    else:
        read = f', {e.sequence}' if e.sequence else ''
        out += (f'    {e.cpp} local;\n'
                f'    const {e.cpp} *element = swigrt::ElementOf(items[i], {e.descriptor.macro}, '
                f'local{read});\n'
                '    if (!element) return SWIG_TypeError;\n'
                f'    {_append(shape, "*element")}\n')
    return out + '  }\n  return SWIG_OK;\n}\n\n'


def _hash_function(cls: str, parts: list[Part]) -> str:
    hashes = []
    for p in parts:
        if p.hash:
            hashes.append(f'{p.hash}(self.{p.expr})')
        else:
            hashes.append(f'swigrt::HashNumber(static_cast<long long>(self.{p.expr}))')
    body = ',\n                              '.join(hashes)
    return (f'// What equal objects read alike, hashed.\n'
            f'Py_hash_t {hash_function(cls)}([[maybe_unused]] const {cls} &self) {{\n'
            f'  return swigrt::HashCombine({{{body}}});\n}}\n\n')


def functions(cls: WrappedClass) -> str:
    p, n = cls.protocols, cls.name
    if p is None:
        return ''
    out = ''
    shape = p.shape
    if shape and shape.numbers:
        out += _numbers(n, shape)
    elif shape and shape.reader and shape.kind == 'grid':
        out += _grid_reader(n, shape)
    elif shape and shape.reader:
        out += _array_reader(n, shape)
    if p.hash is not None and not p.text:
        out += _hash_function(n, p.hash)
    return out
