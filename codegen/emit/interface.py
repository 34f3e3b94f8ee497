"""The module's interface as data, shipped in the package for tools that read
plug-ins (the checker of `vorla --check`): per class its base, its Python
attributes, and the operations the application calls on a subclass, with the
Python argument counts of their overloads and the kind of their result."""
from __future__ import annotations

import json

from ..model import Module


def emit(module: Module) -> str:
    classes = {}
    for c in module.classes:
        calls: dict[str, dict] = {}
        for f in (c.director_class.forwards if c.director_class else []):
            entry = calls.setdefault(f.name, {'arguments': [], 'result': f.result.kind,
                                              'protected': f.protected, 'pure': f.pure})
            count = sum(1 for a in f.args if a.kind != 'status_out')
            if count not in entry['arguments']:
                entry['arguments'].append(count)
        classes[c.name] = {
            'base': c.python_base,
            'director': c.director,
            'attributes': sorted({m.field if m.accessor else m.member for m in c.members}
                                 | {k.name[len(c.name) + 1:] for k in c.constants}
                                 | {v.name[len(c.name) + 1:] for v in c.variables}),
            'calls': dict(sorted(calls.items())),
        }
    return json.dumps({'module': module.proxy, 'classes': classes}, indent=1, sort_keys=True) + '\n'
