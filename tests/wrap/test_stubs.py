"""The stubs installed beside the modules: mypy's stubtest finds them
consistent with the built package, and a type checker reading them accepts
the example plug-ins and finds a plug-in's mistakes."""
import os
import subprocess
import sys

import pytest

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
PYTHON_DIR = os.path.join(ROOT, os.environ.get('OPENVORLA_BUILD', 'build'), 'python')
ALLOWLIST = os.path.join(os.path.dirname(os.path.abspath(__file__)), 'stubtest_allowlist.txt')


def mypy(tool, *args, cache):
    env = dict(os.environ, MYPYPATH=PYTHON_DIR, PYTHONPATH=PYTHON_DIR, MYPY_CACHE_DIR=str(cache))
    return subprocess.run([sys.executable, '-m', tool, *args], env=env, cwd=ROOT,
                          capture_output=True, text=True, timeout=600)


@pytest.fixture(scope='module')
def cache(tmp_path_factory):
    return tmp_path_factory.mktemp('mypy-cache')


def test_package_is_typed():
    names = set(os.listdir(os.path.join(PYTHON_DIR, 'openvorla')))
    assert {'py.typed', '__init__.pyi', '_methods.pyi', 'OpenVorla.pyi', 'OpenVorlaVPx.pyi',
            '_OpenVorla.pyi', '_OpenVorlaVPx.pyi'} <= names


def test_stubtest_finds_no_error(cache):
    run = mypy('mypy.stubtest', 'openvorla', '--allowlist', ALLOWLIST, cache=cache)
    assert run.returncode == 0, run.stdout + run.stderr
    # The package, its two extensions, their proxy modules, _methods and check.
    assert run.stdout.strip().splitlines()[-1] == 'Success: no issues found in 7 modules'


def test_the_example_plugins_type_check(cache):
    run = mypy('mypy', '--check-untyped-defs', '--ignore-missing-imports', 'examples/plugins',
               cache=cache)
    assert run.returncode == 0, run.stdout
    count = len([f for f in os.listdir(os.path.join(ROOT, 'examples', 'plugins'))
                 if f.endswith('.py')])
    assert run.stdout.strip() == f'Success: no issues found in {count} source files'


MISTAKES = '''\
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Node(vpx.VPxNode):
    def compute(self, plug: ov.VPlug, data: ov.VDataBlock) -> int:
        return 0

    def isAbstractClass(self) -> bool:
        return True


def initialize() -> None:
    numeric = ov.VFnNumericAttribute()
    numeric.create('input', 'in', ov.VFnNumericData.kDouble, 'zero')
    vpx.VPxNode.addAttribute(None)
    name: int = Node().typeName()
    vpx.VPxNode().getFilesToArchive(True, False, False, True)
    flag = vpx.boolPtr()
    Node().legalConnection(ov.VPlug(), ov.VPlug(), True, flag)
    points = ov.VPointArray([[1, 2, 3], (4, 5, 6), ov.VPoint(), 'x'])
    gap: float = points[0] - points[1]
    rows: list[list[float]] = ov.VMatrix([[1, 0], [0, 1]]).get()
'''


def test_a_plugins_mistakes_are_found(cache, tmp_path):
    (tmp_path / 'mistakes.py').write_text(MISTAKES)
    run = mypy('mypy', '--no-error-summary', '--hide-error-context', str(tmp_path / 'mistakes.py'),
               cache=cache)
    errors = [line.partition(': error: ')[2] for line in run.stdout.splitlines()
              if ': error: ' in line]   # not the notes that explain them
    assert errors == [
        'Return type "int" of "compute" incompatible with return type '
        '"Optional[Literal[\'unknown\']]" in supertype "VPxNode"  [override]',
        'Argument 4 to "create" of "VFnNumericAttribute" has incompatible type "str"; '
        'expected "float"  [arg-type]',
        'Argument 1 to "addAttribute" of "VPxNode" has incompatible type "None"; '
        'expected "VObject"  [arg-type]',
        'Incompatible types in assignment (expression has type "str", variable has type '
        '"int")  [assignment]',
        'Too many arguments for "getFilesToArchive" of "VPxNode"  [call-arg]',
        'List item 3 has incompatible type "str"; expected "_Sequence[float]"  [list-item]',
        'Incompatible types in assignment (expression has type "VVector", variable has type '
        '"float")  [assignment]',
    ]
