"""The emitted text for the fixture SDK, compared whole with blessed copies.

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


def outputs():
    cwd = os.getcwd()
    os.chdir(os.path.dirname(os.path.dirname(HERE)))  # banners name the manifest relative to the root
    try:
        module = load_module('tests/codegen/fixtures/fixture.toml',
                             ['tests/codegen/fixtures/include'])
    finally:
        os.chdir(cwd)
    files = render(module)
    files['Fixture.py'] = proxy.emit(module)
    files['Fixture.pyi'] = stubs.emit_proxy(module)
    files['_Fixture.pyi'] = stubs.emit_extension(module)
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
