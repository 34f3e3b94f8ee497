"""The emitted text for the fixture SDK's two modules (the second, values/,
with value protocols and strict scalars), compared whole with blessed copies.

After an intended change of the output, re-bless with
    OPENVORLA_BLESS=1 /usr/bin/python3 -m pytest tests/codegen/test_golden.py
and review the diff of tests/codegen/golden/ before committing it.
"""
import os

import pytest

from codegen.__main__ import load_module, render
from codegen.emit import proxy, stubs

HERE = os.path.dirname(__file__)
GOLDEN = os.path.join(HERE, 'golden')


MODULES = {'': 'tests/codegen/fixtures/fixture.toml',
           'values/': 'tests/codegen/fixtures/values.toml'}


def outputs():
    files = {}
    cwd = os.getcwd()
    os.chdir(os.path.dirname(os.path.dirname(HERE)))  # banners name the manifest relative to the root
    try:
        modules = {d: load_module(m, ['tests/codegen/fixtures/include']) for d, m in MODULES.items()}
    finally:
        os.chdir(cwd)
    for folder, module in modules.items():
        mine = render(module)
        mine[f'{module.proxy}.py'] = proxy.emit(module)
        mine[f'{module.proxy}.pyi'] = stubs.emit_proxy(module)
        mine[f'{module.name}.pyi'] = stubs.emit_extension(module)
        files.update({folder + name: text for name, text in mine.items()})
    return files


def test_output_is_deterministic():
    assert outputs() == outputs()


@pytest.mark.parametrize('name', sorted(outputs()))
def test_matches_golden(name):
    text = outputs()[name]
    path = os.path.join(GOLDEN, name)
    if os.environ.get('OPENVORLA_BLESS'):
        os.makedirs(os.path.dirname(path), exist_ok=True)
        with open(path, 'w', encoding='utf-8') as f:
            f.write(text)
    with open(path, encoding='utf-8') as f:
        assert text == f.read(), f'{name} differs from its golden copy (see the module docstring)'
