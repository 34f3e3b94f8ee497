"""The hostile walk: every built-in function of both extension modules, called
with plausible arguments in which one position at a time holds a hostile value.
Run in a child process; it prints one line per entry point before calling it
(so a crash or a hang names its place) and one line per broken rule, and ends
with "done".

    python3 walk.py SHARD SHARDS
"""
import math
import os
import sys

HERE = os.path.dirname(os.path.abspath(__file__))
ROOT = os.path.dirname(os.path.dirname(HERE))

import vorlatesthost as host  # noqa: E402
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx  # noqa: E402
from openvorla import _OpenVorla, _OpenVorlaVPx  # noqa: E402
from codegen.__main__ import load_module  # noqa: E402

ALLOWED = (TypeError, ValueError, OverflowError, RuntimeError, AttributeError, MemoryError,
           IndexError)
STRING_ERRORS = ('Expected a String or Unicode object for argument ',
                 'Expected a list of Strings or Unicode objects for argument ')


class Raises:
    """An object whose truth test, index and length all raise."""
    def __bool__(self):
        raise ZeroDivisionError('truth')

    def __index__(self):
        raise ZeroDivisionError('index')

    def __len__(self):
        raise ZeroDivisionError('len')


def looping():
    """A list that holds itself."""
    loop = []
    loop.append(loop)
    return loop


def hostile_values():
    nested = []
    for _ in range(50):
        nested = [nested]
    return [None, 0, -1, 7, 2 ** 31, 2 ** 32, 2 ** 63, -(2 ** 100), 1.5, math.nan, -math.inf,
            True, '', 'x' * 1000, '\udcff', 'é', b'bytes', bytearray(b'ab'), [], [1, [2, [3]]],
            ['a', 1], ('a',), nested, looping(), {}, object(), Raises(), int, ov.VPoint(),
            _OpenVorlaVPx.new_intPtr(), ov.VObject(), lambda *a: None]


PYTHON_CLASSES = {}


def python_class(descriptor_name):
    name = descriptor_name[len('_p_'):]
    return PYTHON_CLASSES.get(name)


def make(cls, director=False):
    """An instance of a wrapped class, plain when the host allows it, else of
    a bare Python subclass (a director); None when neither can be made."""
    if cls is vpx.VFnPlugin:
        return vpx.VFnPlugin(host.load_plugin('walk', '/walk.py'))
    subclass = type('Walk' + cls.__name__, (cls,), {})
    for factory in ((subclass,) if director else (cls, subclass)):
        try:
            return factory()
        except Exception:
            pass
    return None


def valid(arg):
    """A value the argument accepts, so that the hostile one is reached."""
    if arg.kind == 'scalar':
        return {'AsBool': True, 'AsChar': 'a', 'AsDouble': 0.5, 'AsFloat': 0.5}.get(arg.converter, 0)
    if arg.kind in ('string', 'string_ptr', 'chars'):
        return 'walk'
    if arg.kind == 'string_array':
        return ['walk']
    if arg.kind == 'callable':
        return lambda *a: None
    if arg.kind == 'object' and arg.descriptor is not None:
        cls = python_class(arg.descriptor.name)
        return make(cls) if cls is not None else None
    return None


CALLS = [0]


def check(name, call, problems, lenient=True):
    CALLS[0] += 1
    # Every call goes through the test host's checked call: the interpreter
    # lets a built-in's result with an error set through unnoticed. Only the
    # proxy module's lenient strings may go on with an error set.
    try:
        call()
    except SystemError as e:
        cause = e.__cause__
        if not (lenient and 'returned a result with an exception set' in str(e) and
                isinstance(cause, TypeError) and str(cause).startswith(STRING_ERRORS)):
            problems.append(f'{name}: SystemError {e!r} from {cause!r}')
    except ALLOWED:
        pass
    except Exception as e:  # noqa: BLE001 - any other class is the finding
        problems.append(f'{name}: {type(e).__name__}: {e}')


def calls_of(entry, ext, director):
    """(label, thunk) pairs for one entry point of the model; members of a
    class with a director are called on a plain object and on a director."""
    fn = getattr(ext, entry.entry)
    corpus = hostile_values()
    for candidate, as_director in [(c, False) for c in entry.candidates] + \
            [(c, True) for c in entry.candidates if director and c.args and c.args[0].is_self]:
        slots = sorted((a for a in candidate.args if a.slot is not None), key=lambda a: a.slot)
        base = [valid(a) for a in slots]
        if as_director:
            base[0] = make(python_class(slots[0].descriptor.name), director=True)
        if entry.takes_self:
            base = [None] + base           # the Python object of a constructor
        if slots and slots[0].is_self and base[0] is None:
            continue                       # no object of the class to call it on
        first = 1 if slots and slots[0].is_self else 0
        for i in range(first, len(base)):
            for value in corpus:
                args = list(base)
                args[i] = value
                yield f'{entry.entry} #{i + 1}', lambda a=tuple(args): host.checked_call(fn, a)
        yield f'{entry.entry} +1', lambda a=tuple(base) + (None,): host.checked_call(fn, a)
        yield f'{entry.entry} -1', lambda a=tuple(base[:-1]): host.checked_call(fn, a)
    for value in corpus:
        yield f'{entry.entry} alone', lambda a=(value,): host.checked_call(fn, a)


def protocol_calls(entry, ext, cls):
    """(label, thunk) pairs for a special method of a value class without
    candidates (a subscript, a length, a repr): called on an object of the
    class with a hostile value in each position."""
    fn = getattr(ext, entry.entry)
    obj = make(cls) if cls is not None else None
    if obj is None:
        return
    base = [obj] + [0] * max(len(f.params) for f in entry.forms)
    for i in range(1, len(base)):
        for value in hostile_values():
            args = list(base)
            args[i] = value
            yield f'{entry.entry} #{i + 1}', lambda a=tuple(args): host.checked_call(fn, a)
    yield f'{entry.entry} +1', lambda a=tuple(base) + (None,): host.checked_call(fn, a)
    for value in hostile_values():
        yield f'{entry.entry} alone', lambda a=(value,): host.checked_call(fn, a)


def main(shard, shards):
    modules = [(load_module(os.path.join(ROOT, 'wrap', f'{n}.toml'), [os.path.join(ROOT, 'host', 'include')]),
                ext) for n, ext in (('OpenVorla', _OpenVorla), ('OpenVorlaVPx', _OpenVorlaVPx))]
    for proxy in (ov, vpx):
        PYTHON_CLASSES.update({k: v for k, v in vars(proxy).items() if isinstance(v, type)})
    entries = []
    for model, ext in modules:
        for c in model.classes:
            for e in ([c.constructor] if c.constructor else []) + c.members:
                if e.candidates or e.protocol:
                    entries.append((e, ext, c))
    problems = []
    mine = [x for k, x in enumerate(entries) if k % shards == shard]
    for entry, ext, c in mine:
        print(entry.entry, flush=True)
        thunks = calls_of(entry, ext, c.director) if entry.candidates else \
            protocol_calls(entry, ext, PYTHON_CLASSES.get(c.name))
        for label, call in thunks:
            check(label, call, problems, ext is _OpenVorlaVPx)
    # The rest of every module's table: destruction, hand-over, registration
    # helpers and free functions, with every hostile value alone and in pairs.
    for model, ext in modules:
        names = [e.name for e in model.entries if not e.name.endswith('_swigregister')]
        for k, name in enumerate(names):
            if k % shards != shard or any(name == e.entry for e, _, _ in entries):
                continue
            print(name, flush=True)
            fn = getattr(ext, name)
            for value in hostile_values():
                for args in ((value,), (object(), value), ()):
                    check(name, lambda: host.checked_call(fn, args), problems,
                          ext is _OpenVorlaVPx)
    for p in problems:
        print('PROBLEM', p, flush=True)
    host.unload_all_plugins()
    print(f'done: {CALLS[0]} calls', flush=True)


if __name__ == '__main__':
    main(int(sys.argv[1]), int(sys.argv[2]))
