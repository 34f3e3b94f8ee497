"""Command line of the binding generator.

  python3 -m codegen outputs  MANIFEST                 files a run writes, one per line
  python3 -m codegen generate MANIFEST --include DIR --cxx-out DIR --py-out DIR
  python3 -m codegen drive    MANIFEST --include DIR --out FILE
                                                       a test host's call of every override
"""
from __future__ import annotations

import argparse
import os
import sys

from . import manifest as manifest_mod
from . import model as model_mod
from . import parse as parse_mod
from .emit import (directors, drive, entries, header, init, interface, proxy, stubs, table,
                   types, variables)
from .model.drive import drive_calls


def cxx_outputs(m: manifest_mod.Manifest) -> list[str]:
    """Files a run writes below its output directory: wrap/ and director/."""
    families = sorted({c.family for c in m.classes} | ({'pointers'} if m.pointer_classes else set()))
    director_families = sorted({c.family for c in m.classes if c.director})
    return ([f'wrap/{m.proxy}_wrap.h', 'wrap/types.cpp', 'wrap/method_table.cpp',
             'wrap/module_init.cpp', 'wrap/variables.cpp']
            + [f'wrap/{f}.cpp' for f in families]
            + [f'director/{f}.cpp' for f in director_families])


def render(module: model_mod.Module) -> dict[str, str]:
    files = {f'wrap/{module.ident}_wrap.h': header.emit(module),
             'wrap/types.cpp': types.emit(module),
             'wrap/method_table.cpp': table.emit(module),
             'wrap/module_init.cpp': init.emit(module),
             'wrap/variables.cpp': variables.emit(module)}
    for family in module.families:
        files[f'wrap/{family}.cpp'] = entries.emit(module, family)
    if module.pointer_classes:
        files['wrap/pointers.cpp'] = entries.emit(module, 'pointers')
    for family in module.director_families:
        files[f'director/{family}.cpp'] = directors.emit(module, family)
    return files


def load_module(manifest_path: str, include_dirs: list[str]) -> model_mod.Module:
    return load_with_headers(manifest_path, include_dirs)[0]


def sibling_manifests(manifest_path: str, m: manifest_mod.Manifest) -> list[manifest_mod.Manifest]:
    """The manifests of the modules sharing the type table, beside this one;
    a module whose manifest is elsewhere is known to this one by name only."""
    out = []
    for name in m.imports + m.siblings:
        path = os.path.join(os.path.dirname(manifest_path), f'{name}.toml')
        if os.path.exists(path):
            out.append(manifest_mod.load(path))
    return out


def load_with_headers(manifest_path: str, include_dirs: list[str]):
    m = manifest_mod.load(manifest_path, os.path.relpath(manifest_path))
    headers = parse_mod.parse([c.header for c in m.classes], include_dirs, m.namespace)
    return model_mod.build(m, headers, sibling_manifests(manifest_path, m)), headers


def _write(path: str, text: str):
    """Writes only when the text changed, so unchanged sources are not rebuilt."""
    try:
        with open(path, encoding='utf-8') as f:
            if f.read() == text:
                return
    except FileNotFoundError:
        pass
    os.makedirs(os.path.dirname(path), exist_ok=True)
    with open(path, 'w', encoding='utf-8') as f:
        f.write(text)


def main(argv: list[str]) -> int:
    ap = argparse.ArgumentParser(prog='codegen')
    sub = ap.add_subparsers(dest='cmd', required=True)
    o = sub.add_parser('outputs')
    o.add_argument('manifest')
    g = sub.add_parser('generate')
    g.add_argument('manifest')
    g.add_argument('--include', action='append', required=True)
    g.add_argument('--cxx-out', required=True)
    g.add_argument('--py-out', required=True)
    d = sub.add_parser('drive')
    d.add_argument('manifest')
    d.add_argument('--include', action='append', required=True)
    d.add_argument('--out', required=True)
    args = ap.parse_args(argv)

    if args.cmd == 'outputs':
        m = manifest_mod.load(args.manifest)
        print('\n'.join(cxx_outputs(m)))
        return 0
    try:
        module, headers = load_with_headers(args.manifest, args.include)
    except (parse_mod.ParseError, model_mod.GeneratorError, manifest_mod.ManifestError) as e:
        print(f'codegen: {e}', file=sys.stderr)
        return 1
    if args.cmd == 'drive':
        _write(args.out, drive.emit(module, drive_calls(module, headers)))
        return 0
    for name, text in render(module).items():
        _write(os.path.join(args.cxx_out, name), text)
    _write(os.path.join(args.py_out, f'{module.proxy}.py'), proxy.emit(module))
    _write(os.path.join(args.py_out, f'{module.proxy}.interface.json'), interface.emit(module))
    _write(os.path.join(args.py_out, f'{module.proxy}.pyi'), stubs.emit_proxy(module))
    _write(os.path.join(args.py_out, f'{module.name}.pyi'), stubs.emit_extension(module))
    return 0


if __name__ == '__main__':
    sys.exit(main(sys.argv[1:]))
