"""Documentation at run time: the proxy classes and their methods say, with
their Python signatures, what the application calls on a subclass and what it
expects back, carrying over the headers' comments; the class constants are
listed with their values."""
import inspect
import keyword
import os
import pydoc
import re

import pytest

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m
from openvorla import _methods

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
CALLS = 'Operations the application calls on a subclass:'
APPLICATION = 'The application calls it on an instance of a subclass that overrides it, as'


def model(name):
    from codegen.__main__ import load_module
    return load_module(os.path.join(ROOT, 'wrap', f'{name}.toml'),
                       [os.path.join(ROOT, 'host', 'include')])


VPX = model('OpenVorlaVPx')
DIRECTORS = [c for c in VPX.classes if c.director_class]

# What an override returns, by the kind of the C++ result.
RESULTS = {'void': 'None', 'status': "Literal['unknown'] | None", 'bool': 'bool',
           'string': 'str', 'chars': 'str', 'string_array': 'list[str]'}


def section(doc, title):
    """The indented lines under `title` in a class docstring."""
    lines = doc.split('\n')
    if title not in lines:
        return []
    out = []
    for line in lines[lines.index(title) + 1:]:
        if not line.startswith('    '):
            break
        out.append(line[4:])
    return out


def described(line):
    name, params, result = re.fullmatch(r'(\w+)\((.*)\) -> (.*)', line).groups()
    names = [p.split(':')[0] for p in params.split(', ')] if params else []
    return name, names, result


@pytest.mark.parametrize('cls', DIRECTORS, ids=lambda c: c.name)
def test_docs_cover_every_forwarding_override(cls):
    proxy = getattr(vpx, cls.name)
    listed = [described(line) for line in section(proxy.__doc__, CALLS)]
    expected = []
    for f in cls.director_class.forwards:
        names = [a.name + '_' if keyword.iskeyword(a.name) else a.name
                 for a in f.args if a.kind != 'status_out']
        expected.append((f.name, names))
    assert [(name, names) for name, names, _ in listed] == expected
    for (name, names, result), f in zip(listed, cls.director_class.forwards):
        if f.result.kind in RESULTS:
            assert result == RESULTS[f.result.kind], f.qualified
        # The method the override replaces says the same, whichever class declares it.
        method_doc = getattr(proxy, name).__doc__
        calls = [described(line) for line in section(method_doc, APPLICATION)]
        assert (name, names, result) in calls, f.qualified


@pytest.mark.parametrize('module', [vpx, ov], ids=lambda mod: mod.__name__)
def test_constants_are_listed_with_their_values(module):
    for name in dir(module):
        cls = getattr(module, name)
        if not isinstance(cls, type) or not cls.__doc__:
            continue
        for line in section(cls.__doc__, 'Constants:'):
            constant, _, value = line.partition(' = ')
            assert getattr(cls, constant) == int(value), f'{name}.{constant}'


def test_a_method_says_what_the_header_says_and_what_to_return():
    assert vpx.VPxNode.compute.__doc__ == (
        "compute(plug: OpenVorla.VPlug, dataBlock: OpenVorla.VDataBlock) -> Literal['unknown'] | None\n"
        '\n'
        "Computes the plug's value into the data block. kUnknownParameter means\n"
        'that the node does not compute this plug and the host should.\n'
        '\n'
        f'{APPLICATION}\n'
        "    compute(plug: OpenVorla.VPlug, dataBlock: OpenVorla.VDataBlock) -> Literal['unknown'] | None\n"
        "Return None when it succeeds, or 'unknown' to leave the decision to the\n"
        'application; raise an exception to report a failure.')
    # An overloaded operation lists each form; the application calls both.
    assert vpx.VPxNode.internalArrayCount.__doc__ == (
        'internalArrayCount(plug: OpenVorla.VPlug) -> int\n'
        'internalArrayCount(plug: OpenVorla.VPlug, ctx: OpenVorla.VDGContext) -> int\n'
        '\n'
        'The element count of an internal array attribute; -1: the host counts.\n'
        '\n'
        f'{APPLICATION}\n'
        '    internalArrayCount(plug: OpenVorla.VPlug) -> int\n'
        '    internalArrayCount(plug: OpenVorla.VPlug, ctx: OpenVorla.VDGContext) -> int\n'
        'Return an int.')
    # A member the application does not call has its signature and comment only.
    assert vpx.VPxNode.setMPSafe.__doc__ == (
        'setMPSafe(flag: bool) -> None\n\nWhether compute may run on several threads at once.')


def test_signatures_through_the_class_and_an_instance():
    assert str(inspect.signature(vpx.VPxNode.compute)) == '(self, plug, dataBlock, /)'
    assert str(inspect.signature(vpx.VPxNode().compute)) == '(plug, dataBlock, /)'
    assert str(inspect.signature(vpx.VPxNode.getFilesToArchive)) == (
        '(self, shortName=False, unresolvedName=False, markCouldBeImageSequence=False, /)')
    # Overloads have no one signature: their documentation lists the forms.
    with pytest.raises(ValueError):
        inspect.signature(vpx.VPxNode.internalArrayCount)


def test_help_shows_the_class_comment_the_calls_and_the_constants():
    text = pydoc.render_doc(vpx.VPxNode, renderer=pydoc.plaintext)
    for expected in ['Base class of the dependency-graph nodes that plug-ins define.',
                     CALLS, '    compute(plug: OpenVorla.VPlug, dataBlock: OpenVorla.VDataBlock)',
                     'compute = VPxNode_compute(self, plug, dataBlock, /)',
                     '    kDependNode = 0', '    message: OpenVorla.VObject']:
        assert expected in text
    # The sibling's classes carry their header comments too.
    assert ov.VObject.__doc__ == ('Handle to a host object (node, attribute, data). '
                                  'Copies share the object.')


def test_the_method_type_takes_its_documentation_and_signature():
    method = _methods.method(m.VPxNode_compute, 'computes', '($self, plug, dataBlock, /)')
    assert method.__doc__ == 'computes' and method.__text_signature__ == '($self, plug, dataBlock, /)'
    assert str(inspect.signature(method)) == '(self, plug, dataBlock, /)'
    plain = _methods.method(m.VPxNode_compute)
    assert plain.__doc__ is None and plain.__text_signature__ is None
    with pytest.raises(TypeError) as e:
        _methods.method(m.VPxNode_compute, 'doc', 3)
    assert str(e.value) == 'method() signature must be a str or None'
    with pytest.raises(TypeError) as e:
        _methods.method(m.VPxNode_compute, doc='doc')
    assert str(e.value) == 'method() takes no keyword arguments'
