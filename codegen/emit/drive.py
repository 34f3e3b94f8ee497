"""A test host's call of every forwarding override: one function per override,
which makes the arguments the way the model says and calls the virtual
operation through the proxy class, protected ones included."""
from __future__ import annotations

from .common import banner, c_string
from ..model import Module
from ..model.drive import DriveArg, DriveCall


def _local(n: int, a: DriveArg) -> str:
    name = f'a{n}'
    return {
        'value': lambda: f'  {a.local} {name}{{}};\n',
        'sample': lambda: f'  auto &{name} = drive::Sample<{a.local}>(samples, {c_string(a.descriptor)});\n',
        'storage': lambda: f'  drive::Storage s{n};\n  auto &{name} = s{n}.as<{a.local}>();\n',
        'null': lambda: f'  {a.local} {name} = nullptr;\n',
        'text': lambda: f'  char {name}[] = "drive";\n',
        'istream': lambda: f'  std::istringstream {name};\n',
        'ostream': lambda: f'  std::ostringstream {name};\n',
    }[a.how]()


def _function(k: int, c: DriveCall) -> str:
    f = c.forward
    locals_ = ''.join(_local(n + 1, a) for n, a in enumerate(c.args))
    names = ', '.join(f'a{n + 1}' for n in range(len(c.args)))
    call = (f'(static_cast<{f.owner} *>(self)->*static_cast<{c.member_pointer}>('
            f'&Access_{_ident(f.owner)}::{f.name}))({names})')
    if f.result.kind == 'void':
        body = f'  {call};\n  Py_RETURN_NONE;\n'
    elif f.result.kind == 'reference':
        body = f'  return drive::OutAddress(&{call});\n'
    else:
        body = f'  return drive::Out({call});\n'
    return (f'// {c.cls}: {f.qualified}\n'
            f'PyObject *call{k}(void *object, [[maybe_unused]] PyObject *samples) {{\n'
            f'  auto *self = static_cast<{c.cls} *>(object);\n' + locals_ + body + '}\n\n')


def _ident(name: str) -> str:
    return name.replace('::', '_')


def emit(module: Module, calls: list[DriveCall]) -> str:
    owners: dict[str, list[str]] = {}
    for c in calls:
        names = owners.setdefault(c.forward.owner, [])
        if c.forward.name not in names:
            names.append(c.forward.name)
    out = [banner(module, 'a host call of every forwarding override, for the test host'),
           '#include "drive_support.h"\n\n']
    out += [f'#include <{h}>\n' for h in module.headers]
    out.append(f'\nusing namespace {module.namespace};\n\nnamespace {{\n\n'
               '// Each operation named as its class declares it, protected ones too.\n')
    for owner, names in sorted(owners.items()):
        usings = ''.join(f'  using {owner}::{n};\n' for n in names)
        out.append(f'struct Access_{_ident(owner)} : {owner} {{\n{usings}}};\n')
    out.append('\n')
    out += [_function(k, c) for k, c in enumerate(calls)]
    out.append('}  // namespace\n\nconst drive::Call drive::calls[] = {\n')
    out += [f'    {{{c_string(c.cls)}, {c_string(c.forward.name)}, {c_string(c.member_pointer)}, '
            f'call{k}}},\n' for k, c in enumerate(calls)]
    out.append('};\n\n'
               f'const std::size_t drive::call_count = {len(calls)};\n')
    return ''.join(out)
