"""The entry points of one family of classes: construction, members,
destruction, hand-over to the host and class registration; and the entry
points of the pointer classes."""
from __future__ import annotations

from . import protocols
from .common import banner, c_string, namespace_close, namespace_open
from ..model import (METH_NOARGS, METH_O, REFUSE_PLAIN, Arg, Candidate, DispatchRule, EntryPoint,
                     Module, PointerClass, WrappedClass)


def _open(function: str, param: str, scope: bool = True) -> str:
    """The head of an entry point, a function try block (see _CLOSE). Its call
    scope keeps alive, until the call is over, any "this" that a pointer
    conversion had to make."""
    return (f'PyObject *{function}(PyObject *, PyObject *{param}) try {{\n'
            + ('  swigrt::CallScope scope;\n' if scope else ''))


# The end of every entry point: a C++ exception becomes a Python one rather
# than unwinding into the interpreter.
_CLOSE = '} catch (...) {\n  return swigrt::ExceptionResult();\n}\n'



def _slot(a: Arg) -> str:
    return f'argv[{a.slot}]'


def _convert(a: Arg) -> str:
    """Declares the argument's local and fills it; a failure returns null."""
    slot, n = _slot(a), a.number
    present = f'{slot} && ' if a.optional else ''
    if a.kind == 'scalar':
        local = f'  {a.cpp} arg{n}' + (f' = {a.default};\n' if a.default else '{};\n')
        call = f'swigrt::ScalarArg(swigrt::{a.converter}({slot}, &arg{n}), {c_string(a.message)})'
        return f'{local}  if ({present}!{call}) return nullptr;\n'
    if a.kind == 'object' and a.numbers:
        cells = ''.join(f'[{d}]' for d in a.shape)
        dims = '{' + ', '.join(str(d) for d in a.shape) + '}'
        return (f'  {a.numbers[0]} numbers{n}{cells};\n  void *argp{n} = nullptr;\n'
                f'  if ({present}!swigrt::GridArg({slot}, {a.descriptor.macro}, &argp{n}, '
                f'&numbers{n}{"[0]" * len(a.shape)}, {dims}, swigrt::{a.numbers[1]},\n'
                f'                             {c_string(a.message)}, '
                f'{c_string(a.null_message)})) return nullptr;\n')
    if a.kind == 'object' and a.sequence:
        return (f'  void *argp{n} = nullptr;\n  {a.value_type} sequence{n};\n'
                f'  if ({present}!swigrt::ValueArg({slot}, {a.descriptor.macro}, &argp{n}, '
                f'sequence{n}, {a.sequence},\n'
                f'                              {c_string(a.message)}, '
                f'{c_string(a.null_message)})) return nullptr;\n')
    if a.kind == 'object':
        descriptor = a.descriptor.macro if a.descriptor else 'nullptr'
        if a.reference:
            call = (f'swigrt::ReferenceArg({slot}, {descriptor}, &argp{n}, '
                    f'{c_string(a.message)}, {c_string(a.null_message)})')
        else:
            flags = 'SWIG_POINTER_DISOWN' if a.disown else '0'
            call = (f'swigrt::PointerArg({slot}, {descriptor}, {flags}, &argp{n}, '
                    f'{c_string(a.message)})')
        return f'  void *argp{n} = nullptr;\n  if ({present}!{call}) return nullptr;\n'
    if a.kind in ('string', 'string_ptr') and a.strict:
        if a.kind == 'string_ptr':
            return (f'  VString arg{n};\n'
                    f'  const bool has{n} = {slot} && {slot} != Py_None;\n'
                    f'  if (has{n} && !swigrt::StrictStringArg({slot}, arg{n}, '
                    f'{c_string(a.message)})) return nullptr;\n')
        local = f'  VString arg{n} = {a.default};\n' if a.default else f'  VString arg{n};\n'
        return (local + f'  if ({present}!swigrt::StrictStringArg({slot}, arg{n}, '
                f'{c_string(a.message)})) return nullptr;\n')
    if a.kind == 'string_array' and a.strict:
        return (f'  VStringArray arg{n};\n'
                f'  if (!swigrt::StrictStringArrayArg({slot}, arg{n}, {c_string(a.message)})) '
                'return nullptr;\n')
    if a.kind == 'array_out':
        cells = ''.join(f'[{d}]' for d in a.shape)
        return f'  {a.cpp} arg{n}{cells} = {{}};\n'
    if a.kind == 'string':
        if a.default:
            return (f'  VString arg{n} = {a.default};\n'
                    f'  if ({slot}) swigrt::StringArg({slot}, arg{n}, {c_string(a.message)});\n')
        return f'  VString arg{n};\n  swigrt::StringArg({slot}, arg{n}, {c_string(a.message)});\n'
    if a.kind == 'string_array':
        return (f'  VStringArray arg{n};\n'
                f'  swigrt::StringArrayArg({slot}, arg{n}, {c_string(a.message)});\n')
    if a.kind == 'string_ptr':
        return (f'  VString arg{n};\n'
                f'  const bool has{n} = {slot} && {slot} != Py_None;\n'
                f'  if (has{n}) swigrt::StringArg({slot}, arg{n}, {c_string(a.message)});\n')
    if a.kind == 'chars':
        call = f'swigrt::ScalarArg(swigrt::AsCharPtr({slot}, &arg{n}), {c_string(a.message)})'
        out = f'  swigrt::CharsArg arg{n};\n'
        if a.default and a.default != 'nullptr':
            out += (f'  if (!{slot}) arg{n}.ptr = const_cast<char *>({a.default});\n'
                    f'  else if (!{call}) return nullptr;\n')
        else:
            out += f'  if ({present}!{call}) return nullptr;\n'
        return out
    if a.kind == 'status_out':
        return f'  VStatus status{n};\n'
    if a.kind == 'callable':
        return (f'  // The Python object itself stands for the function: one reference\n'
                f'  // and the announcement go to the host with it.\n'
                f'  {a.cpp} arg{n} = swigrt::CallableArg<{a.cpp}>({slot}, {a.announce});\n')
    if a.kind == 'pyobject':
        return ''
    raise AssertionError(a.kind)


def _value(a: Arg) -> str:
    n = a.number
    return {
        'scalar': lambda: f'static_cast<{a.cast}>(arg{n})' if a.cast else f'arg{n}',
        'object': lambda: (f'*static_cast<{a.cpp}>(argp{n})' if a.reference and not a.array
                           else f'static_cast<{a.cpp}>(argp{n})'),
        'string': lambda: f'arg{n}',
        'string_array': lambda: f'arg{n}',
        'string_ptr': lambda: f'has{n} ? &arg{n} : nullptr',
        'chars': lambda: f'arg{n}.ptr',
        'status_out': lambda: f'&status{n}',
        'callable': lambda: f'arg{n}',
        'pyobject': lambda: _slot(a),
        'array_out': lambda: f'arg{n}',
    }[a.kind]()


def _check(a: Arg) -> str:
    """A check-only conversion for an overload dispatcher; an optional
    argument that is absent passes."""
    test = _check_present(a)
    return f'(!{_slot(a)} || {test})' if a.optional else test


def _check_present(a: Arg) -> str:
    slot = _slot(a)
    if a.kind == 'callable':
        return f'PyCallable_Check({slot})'
    if a.kind == 'scalar':
        return f'SWIG_IsOK(swigrt::{a.converter}({slot}, nullptr))'
    if a.kind == 'object' and a.numbers:
        dims = '{' + ', '.join(str(d) for d in a.shape) + '}'
        return f'swigrt::GridCheck({slot}, {a.descriptor.macro}, {dims}, swigrt::{a.numbers[1]})'
    if a.kind == 'object' and a.sequence:
        return f'swigrt::ValueCheck({slot}, {a.descriptor.macro}, {a.sequence})'
    if a.kind == 'object':
        flags = 'SWIG_POINTER_NO_NULL' if a.reference else '0'
        descriptor = a.descriptor.macro if a.descriptor else 'nullptr'
        return f'SWIG_IsOK(swigrt::ConvertPtr({slot}, nullptr, {descriptor}, {flags}))'
    if a.kind == 'chars':
        return f'SWIG_IsOK(swigrt::AsCharPtr({slot}, nullptr))'
    text = 'swigrt::IsText' if a.strict else 'PyUnicode_Check'
    if a.kind == 'string':
        return f'{text}({slot})'
    if a.kind == 'string_ptr':
        return f'({slot} == Py_None || {text}({slot}))'
    return f'swigrt::IsTextList({slot})' if a.strict else f'PyList_Check({slot})'


def _result(c: Candidate, call: str, declare: bool = True) -> str:
    """Calls the host and makes `resultobj` (declaring it, unless the caller
    already has); a failure returns null."""
    r = c.result
    target = 'PyObject *resultobj' if declare else 'resultobj'
    if r.kind == 'void':
        return f'  {call};\n  {target} = Py_NewRef(Py_None);\n'
    if r.kind == 'status' and any(a.kind == 'array_out' for a in c.args):
        # What the host fills is the result: any failure is an error.
        return (f'  VStatus result = {call};\n'
                '  if (!swigrt::StatusSucceeded(result)) return nullptr;\n'
                f'  {target} = Py_NewRef(Py_None);\n')
    if r.kind == 'status':
        return (f'  VStatus result = {call};\n'
                f'  {target} = swigrt::StatusResult(result);\n'
                '  if (!resultobj) return nullptr;\n')
    if r.lent:
        me = c.args[0]
        pointer = f'const_cast<{r.cpp} *>({call if r.kind == "pointer" else "&" + call})'
        make = (f'swigrt::SelfOrLentPointerObj({_slot(me)}, argp{me.number}, {pointer}, '
                f'{r.descriptor.macro})' if r.may_be_self else
                f'swigrt::LentPointerObj({_slot(me)}, {pointer}, {r.descriptor.macro})')
        return f'  {target} = {make};\n  if (!resultobj) return nullptr;\n'
    make = {
        'scalar': lambda: (f'{r.converter}(static_cast<long>({call}))'
                           if r.converter == 'PyLong_FromLong' else f'{r.converter}({call})'),
        'chars': lambda: f'swigrt::FromCharPtr({call})',
        'string': lambda: f'swigrt::FromString({call})',
        'string_array': lambda: f'swigrt::FromStringArray({call})',
        'value': lambda: (f'swigrt::NewPointerObj(nullptr, new {r.cpp}({call}), '
                          f'{r.descriptor.macro}, SWIG_POINTER_OWN)'),
        'pointer': lambda: (f'swigrt::NewPointerObj(nullptr, const_cast<{r.cpp} *>({call}), '
                            f'{r.descriptor.macro}, 0)'),
        'reference': lambda: (f'swigrt::NewPointerObj(nullptr, const_cast<{r.cpp} *>(&{call}), '
                              f'{r.descriptor.macro}, 0)'),
    }[r.kind]()
    return f'  {target} = {make};\n  if (!resultobj) return nullptr;\n'


def _after(c: Candidate) -> str:
    """Output lists are rewritten, then a status reported through a pointer
    is tested."""
    out = []
    for a in c.args:
        if a.kind == 'string_array' and a.output:
            not_list, cannot = a.list_messages
            out.append(f'  if (!swigrt::UpdateOutputList({_slot(a)}, arg{a.number}, '
                       f'{c_string(not_list)},\n'
                       f'                                {c_string(cannot)})) {{\n'
                       '    Py_DECREF(resultobj);\n    return nullptr;\n  }\n')
    filled = [a for a in c.args if a.kind == 'array_out']
    if filled:
        lists = ', '.join(
            f'swigrt::GridList(&arg{a.number}{"[0]" * len(a.shape)}, '
            f'{{{", ".join(str(d) for d in a.shape)}}}, '
            f'[]({a.cpp} v) {{ return {_make_number(a.converter, "v")}; }})' for a in filled)
        out.append(f'  resultobj = swigrt::WithOutputs(resultobj, {{{lists}}});\n'
                   '  if (!resultobj) return nullptr;\n')
    for a in c.args:
        if a.kind == 'status_out':
            out.append(f'  if (!swigrt::StatusSucceeded(status{a.number})) {{\n'
                       '    Py_DECREF(resultobj);\n    return nullptr;\n  }\n')
    return ''.join(out)


def _make_number(converter: str, value: str) -> str:
    if converter == 'PyLong_FromLong':
        return f'PyLong_FromLong(static_cast<long>({value}))'
    return f'{converter}({value})'


def _construct(cls: str, ep: EntryPoint, c: Candidate, values: str) -> str:
    """A director for a Python subclass's instance, a plain object for None."""
    wrap = f'{c.result.descriptor.macro}, SWIG_POINTER_NEW'
    refuse = (f'swigrt::SetErrorMessage(PyExc_RuntimeError, {c_string(REFUSE_PLAIN)});\n'
              '  return nullptr;\n')
    if not ep.takes_self:
        if ep.refuse_plain:
            return '  ' + refuse
        return f'  PyObject *resultobj = swigrt::NewPointerObj(nullptr, new {cls}({values}), {wrap});\n'
    director = f"new SwigDirector_{cls}({', '.join(['argv[0]'] + ([values] if values else []))})"
    if ep.refuse_plain:
        out = '  if (argv[0] == Py_None) {\n    ' + refuse.replace('\n  ', '\n    ') + '  }\n'
        out += f'  {cls} *object = {director};\n'
    else:
        out = f'  {cls} *object = argv[0] != Py_None ? {director} : new {cls}({values});\n'
    return out + f'  PyObject *resultobj = swigrt::NewPointerObj(nullptr, object, {wrap});\n'


def _member_call(cls: str, c: Candidate, values: str) -> str:
    """Calls the member. A call from the object's own Python override of it
    (the director's self passed as argument 1) is an upcall: the host's own
    implementation runs, by its qualified name, and the override is not
    entered again. A protected member is open only inside its own override."""
    if c.static:
        return _result(c, f'{cls}::{c.call}({values})')
    self_ptr = f'static_cast<{cls} *>(argp1)'
    if c.protected:
        refused = c_string(f'accessing protected member {c.call}')
        call = (f'(upcall ? director->{c.call}SwigPublic({values}) : director->{c.call}({values}))'
                if c.virtual else f'director->{c.call}SwigPublic({values})')
        return (f'  auto *director = dynamic_cast<SwigDirector_{cls} *>({self_ptr});\n'
                f'  if (!director || !director->swig_get_inner({c_string(c.call)})) {{\n'
                f'    swigrt::SetErrorMessage(PyExc_RuntimeError, {refused});\n'
                '    return nullptr;\n  }\n'
                + ('  const bool upcall = director->swig_get_self() == argv[0];\n' if c.virtual else '')
                + _guarded(_result(c, call, declare=False)))
    if not c.virtual:
        return _result(c, f'{self_ptr}->{c.call}({values})')
    pure = (f'    if (upcall) swigrt::RaisePureVirtual({c_string(f"{c.owner}::{c.call}")});\n'
            if c.pure else '')
    call = (f'{self_ptr}->{c.call}({values})' if c.pure else
            f'(upcall ? {self_ptr}->{cls}::{c.call}({values}) : {self_ptr}->{c.call}({values}))')
    return (f'  Swig::Director *director = Swig::DirectorOf({self_ptr});\n'
            '  const bool upcall = director && director->swig_get_self() == argv[0];\n'
            + _guarded(_result(c, call, declare=False), pure))


def _guarded(body: str, first: str = '') -> str:
    """A director exception means the Python error is set already. `body`
    assigns `resultobj`, declared here outside the guard."""
    inner = first + ''.join(f'  {line}\n' for line in body.rstrip('\n').split('\n'))
    return ('  PyObject *resultobj = nullptr;\n  try {\n' + inner
            + '  } catch (Swig::DirectorException &) {\n    return nullptr;\n  }\n')


def _body(cls: str, ep: EntryPoint, c: Candidate) -> str:
    out = ''.join(_convert(a) for a in c.args)
    values = ', '.join(_value(a) for a in c.args if not a.is_self)
    if not ep.member:
        out += _construct(cls, ep, c, values)
        if ep.refuse_plain and not ep.takes_self:
            return out
    elif ep.accessor:
        field = f'static_cast<{cls} *>(argp1)->{c.call}'
        if ep.accessor == 'get':
            out += _result(c, field)
        else:
            out += f'  {field} = {values};\n  PyObject *resultobj = Py_NewRef(Py_None);\n'
    else:
        out += _member_call(cls, c, values)
    return out + _after(c) + '  return resultobj;\n'


def _dispatch_branch(rule: DispatchRule) -> str:
    lo, hi = rule.counts
    cond = f'argc == {lo}' if lo == hi else f'argc >= {lo} && argc <= {hi}'
    lines = []
    for i, (cand, test) in enumerate(zip(rule.candidates, rule.tests)):
        call = f'result = {cand.function}(argc, argv);'
        keyword = 'else ' if i else ''
        if test is None:
            lines.append(f'    else\n      {call}\n' if i else f'    {call}\n')
        else:
            lines.append(f'    {keyword}if ({_check(test)})\n      {call}\n')
    return f'if ({cond}) {{\n' + ''.join(lines) + '  }'


def _comparison(cls: str, ep: EntryPoint) -> str:
    c = ep.candidates[0]
    self_arg, other = c.args
    op = '==' if ep.member == '__eq__' else '!='
    return (_open(ep.function, 'args') +
            '  PyObject *argv[2] = {};\n'
            f'  if (!swigrt::UnpackTuple(args, {c_string(ep.entry)}, 2, 2, argv)) return nullptr;\n'
            + _convert(self_arg) +
            '  // Anything but an object of the class is for Python to compare.\n'
            '  void *argp2 = nullptr;\n'
            f'  if (!SWIG_IsOK(swigrt::ConvertPtr(argv[1], &argp2, {other.descriptor.macro}, 0)) || '
            '!argp2)\n    Py_RETURN_NOTIMPLEMENTED;\n'
            f'  return PyBool_FromLong(*static_cast<{cls} *>(argp1) {op} '
            f'*static_cast<{cls} *>(argp2));\n' + _CLOSE)


def entry_point(cls: str, ep: EntryPoint) -> str:
    if ep.comparison:
        return _comparison(cls, ep)

    def head(param: str) -> str:
        return _open(ep.function, param, ep.converts_objects)

    if not ep.dispatch:
        c = ep.candidates[0]
        if ep.flags == METH_O:
            reads = ep.takes_self or any(a.slot is not None for a in c.args)
            argv = '  PyObject *argv[1] = {arg};\n' if reads else ''
            return head('arg') + '  if (!arg) return nullptr;\n' + argv + _body(cls, ep, c) + _CLOSE
        if ep.flags == METH_NOARGS:
            return head('') + _body(cls, ep, c) + _CLOSE
        return (head('args') + f'  PyObject *argv[{max(c.max_args, 1)}] = {{}};\n'
                f'  if (!swigrt::UnpackTuple(args, {c_string(ep.entry)}, {c.min_args}, '
                f'{c.max_args}, argv)) return nullptr;\n' + _body(cls, ep, c) + _CLOSE)
    out = []
    for c in ep.candidates:
        count = (f'argc != {c.min_args}' if c.min_args == c.max_args
                 else f'argc < {c.min_args} || argc > {c.max_args}')
        argv = 'PyObject **argv' if any(a.slot is not None for a in c.args) \
            else '[[maybe_unused]] PyObject **argv'
        out.append(f'static PyObject *{c.function}(Py_ssize_t argc, {argv}) {{\n'
                   f'  if ({count}) return nullptr;\n' + _body(cls, ep, c) + '}\n\n')
    branches = ' else '.join(_dispatch_branch(r) for r in ep.dispatch)
    out.append(head('args') + f'  PyObject *argv[{ep.max_args}] = {{}};\n'
               f'  Py_ssize_t argc = swigrt::UnpackTuple(args, {c_string(ep.entry)}, 0, '
               f'{ep.max_args}, argv) - 1;\n'
               '  PyObject *result = nullptr;\n'
               f'  {branches}\n'
               '  if (!swigrt::DispatchFailed(result)) return result;\n'
               f'  swigrt::RaiseOrModifyTypeError({c_string(ep.message)});\n'
               '  return nullptr;\n' + _CLOSE)
    return ''.join(out)


def _class(cls: WrappedClass) -> str:
    d = cls.descriptor.macro
    msg = c_string(f"in method '{cls.delete_entry}', argument 1 of type '{cls.name} *'")
    out = [f'// {cls.name}\n\n']
    if cls.constructor:
        out.append(entry_point(cls.name, cls.constructor) + '\n')
    out.append(_open(f'wrap_{cls.delete_entry}', 'arg') +
               '  if (!arg) return nullptr;\n  void *argp1 = nullptr;\n'
               '  // The wrapper stops pointing at the object: a later use is refused.\n'
               f'  if (!swigrt::PointerArg(arg, {d}, SWIG_POINTER_DISOWN | SWIG_POINTER_FORGET, '
               f'&argp1, {msg})) return nullptr;\n'
               f'  delete static_cast<{cls.name} *>(argp1);\n  Py_RETURN_NONE;\n' + _CLOSE + '\n')
    functions = protocols.functions(cls)
    if functions:
        out.append(functions)
    out += [(protocols.entry_point(cls, m) if m.protocol else entry_point(cls.name, m)) + '\n'
            for m in cls.members if m.candidates or m.protocol]
    if cls.director:
        msg = c_string(f"in method 'disown_{cls.name}', argument 1 of type '{cls.name} *'")
        out.append(_open(f'wrap_disown_{cls.name}', 'arg') +
                   '  if (!arg) return nullptr;\n  void *argp1 = nullptr;\n'
                   f'  if (!swigrt::PointerArg(arg, {d}, 0, &argp1, {msg})) return nullptr;\n'
                   '  // The host keeps the object from now on: its director holds the\n'
                   '  // Python instance until the host deletes it.\n'
                   f'  auto *director = dynamic_cast<Swig::Director *>(static_cast<{cls.name} *>(argp1));\n'
                   '  if (director) director->swig_disown();\n'
                   '  Py_RETURN_NONE;\n' + _CLOSE + '\n')
    out.append(f'PyObject *wrap_{cls.name}_swigregister(PyObject *, PyObject *args) {{\n'
               f'  return swigrt::RegisterClass(args, {d});\n}}\n\n')
    return ''.join(out)


def _pointer_class(p: PointerClass) -> str:
    own, elem, t = p.descriptor.macro, p.element_descriptor.macro, p.element

    def self_arg(entry: str, target: str = own, spelled: str = f'{p.name} *') -> str:
        msg = f"in method '{entry}', argument 1 of type '{spelled}'"
        return (f'  void *argp1 = nullptr;\n  if (!swigrt::ReferenceArg(argv[0], {target}, &argp1, '
                f'{c_string(msg)}, {c_string("invalid null reference " + msg)})) return nullptr;\n'
                f'  {t} *cell = static_cast<{t} *>(argp1);\n')

    def one(what: str, body: str) -> str:
        return (_open(f'wrap_{p.entry(what)}', 'arg') +
                '  if (!arg) return nullptr;\n  PyObject *argv[1] = {arg};\n' + body + _CLOSE + '\n')

    value = {'PyLong_FromLong': 'PyLong_FromLong(static_cast<long>(*cell))'}.get(
        p.result, f'{p.result}(*cell)')
    assign_msg = f"in method '{p.entry('assign')}', argument 2 of type '{t}'"
    delete_msg = f"in method '{p.entry('delete')}', argument 1 of type '{p.name} *'"
    out = [f'// {p.name}\n\n',
           f'PyObject *wrap_{p.entry("new")}(PyObject *, PyObject *args) {{\n'
           '  PyObject *argv[1] = {};\n'
           f'  if (!swigrt::UnpackTuple(args, {c_string(p.entry("new"))}, 0, 0, argv)) '
           'return nullptr;\n'
           f'  return swigrt::NewPointerObj(nullptr, new {t}(), {own}, SWIG_POINTER_NEW);\n}}\n\n',
           _open(f'wrap_{p.entry("delete")}', 'arg') +
           '  if (!arg) return nullptr;\n  void *argp1 = nullptr;\n'
           f'  if (!swigrt::PointerArg(arg, {own}, SWIG_POINTER_DISOWN | SWIG_POINTER_FORGET, '
           f'&argp1, {c_string(delete_msg)})) return nullptr;\n'
           f'  delete static_cast<{t} *>(argp1);\n  Py_RETURN_NONE;\n' + _CLOSE + '\n',
           _open(f'wrap_{p.entry("assign")}', 'args') +
           '  PyObject *argv[2] = {};\n'
           f'  if (!swigrt::UnpackTuple(args, {c_string(p.entry("assign"))}, 2, 2, argv)) '
           'return nullptr;\n' + self_arg(p.entry('assign')) +
           f'  {t} value;\n'
           f'  if (!swigrt::ScalarArg(swigrt::{p.converter}(argv[1], &value), '
           f'{c_string(assign_msg)})) return nullptr;\n'
           '  *cell = value;\n  Py_RETURN_NONE;\n' + _CLOSE + '\n',
           one('value', self_arg(p.entry('value')) + f'  return {value};\n')]
    if t == 'char':
        # The cell read as a C string, and a pointer made from a text argument.
        frompointer_msg = f"in method '{p.entry('frompointer')}', argument 1 of type 'char *'"
        out.append(one('cast', self_arg(p.entry('cast')) + '  return swigrt::FromCharPtr(cell);\n'))
        out.append(one('frompointer',
                       '  swigrt::CharsArg text;\n'
                       f'  if (!swigrt::ScalarArg(swigrt::AsCharPtr(argv[0], &text), '
                       f'{c_string(frompointer_msg)})) return nullptr;\n'
                       f'  return swigrt::NewPointerObj(nullptr, text.ptr, {own}, 0);\n'))
    else:
        out.append(one('cast', self_arg(p.entry('cast')) +
                       f'  return swigrt::NewPointerObj(nullptr, cell, {elem}, 0);\n'))
        out.append(one('frompointer', self_arg(p.entry('frompointer'), elem, f'{t} *') +
                       f'  return swigrt::NewPointerObj(nullptr, cell, {own}, 0);\n'))
    out.append(f'PyObject *wrap_{p.entry("swigregister")}(PyObject *, PyObject *args) {{\n'
               f'  return swigrt::RegisterClass(args, {own});\n}}\n\n')
    return ''.join(out)


def emit(module: Module, family: str) -> str:
    out = [banner(module, f'entry points of the {family} family'),
           f'#include "{module.ident}_wrap.h"\n\n', namespace_open(module), '\n']
    if family == 'pointers':
        out += [_pointer_class(p) for p in module.pointer_classes]
    else:
        out += [_class(c) for c in module.families[family]]
    out.append(namespace_close(module))
    return ''.join(out)
