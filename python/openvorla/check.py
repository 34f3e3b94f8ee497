"""The plug-in checker: faults in a loaded plug-in that Python alone lets
pass, and the application would only show as a value that stays 0 or a
failure far from its cause.

It reads the module's interface (``<Module>.interface.json`` beside this
file: per class its attributes and the operations the application calls,
with their argument counts) and finds, in the plug-in's classes derived from
the proxy classes:

- methods that match no operation or attribute of their proxy bases but come
  close to an operation's name (``compte`` for ``compute``): the application
  never calls them;
- operations whose parameters cannot take the arguments the application
  passes;
- an ``__init__`` that does not call its base's, which leaves the instance
  without its C++ object;
- in the classes the application makes instances of, operations that their
  proxy bases leave to them (pure virtual ones) and that they do not define;

and, in what the plug-in registered, classes that do not derive from the
class their kind is made as, and creator functions that return something
else than an instance of it.

``vorla`` runs it on every plug-in it loads; each finding is a line
``file:line: message``.
"""
import ast
import builtins
import dis
import difflib
import inspect
import json
import os
import textwrap
import types

PROXY_MODULES = ('openvorla.OpenVorlaVPx', 'openvorla.OpenVorla')
# How alike (difflib's ratio, ignoring case) a name must be to an operation's
# to be taken for a misspelling of it.
NEAR_MISS = 0.8

_interface = None


def interface():
    """{(module, class): entry} of both modules' interfaces, read once."""
    global _interface
    if _interface is None:
        _interface = {}
        here = os.path.dirname(os.path.abspath(__file__))
        for module in PROXY_MODULES:
            path = os.path.join(here, module.rsplit('.', 1)[1] + '.interface.json')
            with open(path, encoding='utf-8') as f:
                for name, entry in json.load(f)['classes'].items():
                    _interface[module, name] = entry
    return _interface


def is_proxy(cls):
    return (cls.__module__, cls.__name__) in interface()


def proxy_bases(cls):
    """The proxy classes among the class's bases, nearest first."""
    return [c for c in cls.__mro__ if is_proxy(c)]


def is_plugin_class(cls):
    return isinstance(cls, type) and not is_proxy(cls) and bool(proxy_bases(cls))


class Finding:
    def __init__(self, file, line, message):
        self.file, self.line, self.message = file, line, message

    def key(self):
        return self.file, self.line, self.message


class Checker:
    def __init__(self, shown):
        self.shown = shown  # {real path: path as the user gave it}
        self.findings = []

    def report(self, where, message):
        file, line = where
        self.findings.append(Finding(self.shown.get(file, file), line, message))

    # --- where things are ---

    @staticmethod
    def function_at(function):
        code = function.__code__
        return code.co_filename, code.co_firstlineno

    @staticmethod
    def class_at(cls):
        try:
            return inspect.getsourcefile(cls), inspect.findsource(cls)[1] + 1
        except (OSError, TypeError):
            pass
        # Without its source: the first of its methods.
        for value in vars(cls).values():
            if isinstance(value, types.FunctionType):
                return value.__code__.co_filename, value.__code__.co_firstlineno
        module = inspect.getmodule(cls)
        return getattr(module, '__file__', None) or '<unknown>', 1

    # --- the classes ---

    def check_class(self, cls):
        proxies = proxy_bases(cls)
        nearest = proxies[0].__name__
        operations, attributes = {}, set()
        for proxy in proxies:
            entry = interface()[proxy.__module__, proxy.__name__]
            for name, call in entry['calls'].items():
                operations.setdefault(name, (proxy.__name__, call['arguments']))
            attributes.update(entry['attributes'])
        # What a plug-in base between the class and its proxies defines is
        # checked there.
        inherited = set()
        for base in cls.__mro__[1:]:
            if not is_proxy(base) and base is not object:
                inherited.update(vars(base))
        for name, value in vars(cls).items():
            if not isinstance(value, types.FunctionType):
                continue
            if name == '__init__':
                self.check_init(cls, value)
            elif name in operations:
                self.check_arguments(cls, name, value, *operations[name])
            elif not name.startswith('_') and name not in attributes and name not in inherited:
                self.check_name(cls, name, value, nearest, operations)

    def check_name(self, cls, name, function, nearest, operations):
        lowered = {op.lower(): op for op in operations}
        close = difflib.get_close_matches(name.lower(), lowered, n=1, cutoff=NEAR_MISS)
        if close:
            self.report(self.function_at(function),
                        f'{cls.__qualname__}.{name} matches no operation of {nearest}: '
                        f'did you mean {lowered[close[0]]}?')

    def check_arguments(self, cls, name, function, proxy, counts):
        code = function.__code__
        if code.co_flags & inspect.CO_VARARGS:
            return
        defaults = len(function.__defaults__ or ())
        required_keywords = set(code.co_varnames[code.co_argcount:code.co_argcount
                                                 + code.co_kwonlyargcount])
        required_keywords -= set(function.__kwdefaults__ or ())
        # As the application's call tests it: self and the arguments, positionally.
        if not required_keywords and any(code.co_argcount - defaults <= k + 1 <= code.co_argcount
                                         for k in counts):
            return
        taken = ' or '.join(str(k) for k in sorted(counts))
        noun = 'argument' if counts == [1] else 'arguments'
        self.report(self.function_at(function),
                    f'{cls.__qualname__}.{name}{inspect.signature(function)} cannot take the '
                    f'{taken} {noun} the application passes to {proxy}.{name}')

    def check_init(self, cls, function):
        # super().__init__(...), Base.__init__(self, ...), super(C, self).__init__(...)
        for instruction in dis.get_instructions(function):
            if instruction.argval == '__init__' and instruction.opname in ('LOAD_ATTR',
                                                                          'LOAD_METHOD'):
                return
        base = next(c for c in cls.__mro__[1:] if c is not object)
        self.report(self.function_at(function),
                    f'{cls.__qualname__}.__init__ does not call {base.__qualname__}.__init__')

    def check_pure(self, cls):
        """The operations that the class's proxy bases leave to it."""
        defined = set()
        for base in cls.__mro__:
            if not is_proxy(base):
                defined.update(vars(base))
        missing = {}
        for proxy in proxy_bases(cls):
            entry = interface()[proxy.__module__, proxy.__name__]
            for name, call in entry['calls'].items():
                if call['pure'] and name not in defined:
                    missing.setdefault(name, proxy.__name__)
        for name, proxy in sorted(missing.items()):
            self.report(self.class_at(cls), f'{cls.__qualname__} does not define {name}, '
                                            f'which {proxy} leaves to its subclasses')

    # --- what the plug-in registered ---

    def check_creator(self, kind, name, creator, makes):
        registered = f"register{kind}('{name}')"
        if isinstance(creator, type):
            if not issubclass(creator, makes):
                self.report(self.class_at(creator),
                            f'{creator.__qualname__}, the creator of {registered}, is not a '
                            f'subclass of {makes.__name__}')
            return None
        if not isinstance(creator, types.FunctionType):
            return None
        made = set()
        for line, returned in returns(creator):
            if returned is None:
                what = 'None'
            elif not isinstance(returned, type):
                continue
            elif issubclass(returned, makes):
                made.add(returned)
                continue
            else:
                what = article(returned.__qualname__)
            self.report((creator.__code__.co_filename, line),
                        f'{creator.__qualname__}, the creator of {registered}, returns {what}, '
                        f'not a subclass of {makes.__name__}')
        return made


def article(name):
    return ('an ' if name[:1] in 'AEIOUaeiou' else 'a ') + name


def returns(function):
    """(line, what) of each return of the function that can be told from its
    source: a class it instantiates, or None; nothing for a return of
    anything else."""
    try:
        lines, first = inspect.getsourcelines(function)
        tree = ast.parse(textwrap.dedent(''.join(lines)))
    except (OSError, TypeError, SyntaxError):
        return []
    if function.__name__ == '<lambda>':
        # Its source is the statement it is in: the lambda whose body is
        # where the code's instructions are.
        indent = len(lines[0]) - len(lines[0].lstrip())
        body = {(line - first + 1, column - indent)
                for line, _, column, _ in function.__code__.co_positions()
                if line is not None and column is not None}
        lambdas = [n for n in ast.walk(tree) if isinstance(n, ast.Lambda)
                   and (n.body.lineno, n.body.col_offset) in body]
        if len(lambdas) != 1:
            return []
        line = lambdas[0].body.lineno
        tree = ast.Module([ast.FunctionDef(
            '<lambda>', lambdas[0].args, [ast.Return(lambdas[0].body, lineno=line)], [])], [])
    body = tree.body[0] if tree.body else None
    if not isinstance(body, (ast.FunctionDef, ast.AsyncFunctionDef)):
        return []  # a def that the source does not start with
    found, returned = [], False
    for node in walk_body(body):
        if not isinstance(node, ast.Return):
            continue
        returned = True
        line = node.lineno + first - 1
        if node.value is None or (isinstance(node.value, ast.Constant)
                                  and node.value.value is None):
            found.append((line, None))
        elif isinstance(node.value, ast.Call):
            cls = resolve(node.value.func, function)
            if cls is not None:
                found.append((line, cls))
    if not returned:  # falls off its end
        found.append((body.body[-1].end_lineno + first - 1, None))
    return found


def walk_body(function):
    """The nodes of the function's body, not of the functions and classes in it."""
    stack = list(function.body)
    while stack:
        node = stack.pop()
        yield node
        if not isinstance(node, (ast.FunctionDef, ast.AsyncFunctionDef, ast.Lambda,
                                 ast.ClassDef)):
            stack.extend(ast.iter_child_nodes(node))


def resolve(expression, function):
    """The object a name or dotted name stands for in the function's globals,
    or None."""
    if isinstance(expression, ast.Name):
        missing = object()
        value = function.__globals__.get(expression.id, missing)
        if value is missing:
            value = getattr(builtins, expression.id, None)
        return value
    if isinstance(expression, ast.Attribute):
        owner = resolve(expression.value, function)
        if isinstance(owner, (types.ModuleType, type)):
            return getattr(owner, expression.attr, None)
    return None


def check(module, callbacks, shown=None):
    """The findings on the plug-in module and what it registered
    (``callbacks``: (kind, name, role, object, makes) as
    ``vorla.callbacks()`` lists them), as "file:line: message" lines in the
    order of the files and lines. ``shown``: the module's file as it is to
    be printed."""
    checker = Checker({module.__file__: shown} if shown else {})
    classes = {id(c): c for c in vars(module).values()
               if is_plugin_class(c) and c.__module__ == module.__name__}
    registered = {}  # the classes the application makes instances of
    from . import OpenVorlaVPx
    for kind, name, _, creator, makes in callbacks:
        proxy = getattr(OpenVorlaVPx, makes, None) if makes else None
        if proxy is None:
            continue
        made = checker.check_creator(kind, name, creator, proxy) or ()
        for cls in (creator, *made):
            if is_plugin_class(cls):
                classes.setdefault(id(cls), cls)
                registered.setdefault(id(cls), cls)
    for cls in classes.values():
        checker.check_class(cls)
    for cls in registered.values():
        checker.check_pure(cls)
    findings = sorted(checker.findings, key=Finding.key)
    return [f'{f.file}:{f.line}: {f.message}' for f in findings]


def check_plugin(module, plugin, shown=None):
    """check() on a plug-in that vorla loaded, with what it registered."""
    import vorla
    return check(module, vorla.callbacks(plugin), shown)
