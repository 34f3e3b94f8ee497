"""The type table: descriptors, cast lists and the module record."""
from __future__ import annotations

from .common import banner, c_string, namespace_close, namespace_open
from ..model import Module


def _var(name: str) -> str:
    return 'type' + name


def emit(module: Module) -> str:
    out = [banner(module, 'the type table'), f'#include "{module.ident}_wrap.h"\n\n',
           namespace_open(module), '\nnamespace {\n\n',
           '// Converters of the cast lists. Classes the module knows only by name\n'
           '// derive singly, with the base at the start of the object.\n']
    for d in module.descriptors:
        for c in d.casts:
            if c.derived_cpp:
                body = (f'return static_cast<{c.base_cpp} *>'
                        f'(static_cast<{c.derived_cpp} *>(x));')
            else:
                body = 'return x;'
            out.append(f'void *{c.converter}(void *x, int *) {{ {body} }}\n')
    out.append('\n')
    for d in module.descriptors:
        out.append(f'swig_type_info {_var(d.name)} = {{{c_string(d.name)}, '
                   f'{c_string(d.readable)}, nullptr, nullptr, nullptr, 0}};\n')
    out.append('\n')
    for d in module.descriptors:
        rows = [f'{{&{_var(d.name)}, nullptr, nullptr, nullptr}}']
        rows += [f'{{&{_var(c.source.name)}, {c.converter}, nullptr, nullptr}}' for c in d.casts]
        rows.append('{nullptr, nullptr, nullptr, nullptr}')
        out.append(f'swig_cast_info casts{d.name}[] = {{' + ', '.join(rows) + '};\n')
    out.append('\nswig_type_info *type_initial[] = {\n')
    out += [f'    &{_var(d.name)},\n' for d in module.descriptors]
    out.append('};\n\nswig_cast_info *cast_initial[] = {\n')
    out += [f'    casts{d.name},\n' for d in module.descriptors]
    out.append('};\n\n}  // namespace\n\n')
    out.append(f'swig_type_info *swig_types[{len(module.descriptors) + 1}];\n'
               f'swig_module_info swig_module = {{swig_types, {len(module.descriptors)}, nullptr, '
               'type_initial, cast_initial, nullptr};\n\n')
    out.append(namespace_close(module))
    return ''.join(out)
