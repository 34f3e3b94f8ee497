"""The host calls every forwarding override of every director class once, as
the application would (the calls are generated from the module's model):
on an instance that overrides nothing, the host's own behaviour runs; on one
that overrides every operation, each Python method runs with the arguments
of its C++ signature and its result reaches the host converted."""
import gc
import os

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))


def directors():
    from codegen.__main__ import load_module
    model = load_module(os.path.join(ROOT, 'wrap', 'OpenVorlaVPx.toml'),
                        [os.path.join(ROOT, 'host', 'include')])
    out, k = {}, 0
    for d in model.directors:
        out[d.cls] = [(k + i, f) for i, f in enumerate(d.forwards)]
        k += len(d.forwards)
    assert k == host.drive_count()
    return out


DIRECTORS = directors()


def python_class(name):
    return getattr(vpx, name, None) or getattr(ov, name)


# The constructors that take more than the Python object.
ARGUMENTS = {'VPxGeometryIterator': lambda: (None, ov.VObjectArray()),
             'VPxMaterialInformation': lambda: (ov.VObject(),),
             'VPxRepresentation': lambda: (None, 'representation')}


def instance(cls, namespace):
    return type('Python' + cls, (python_class(cls),), namespace)(*ARGUMENTS.get(cls, tuple)())


@pytest.fixture(scope='module')
def samples():
    # Objects of the abstract classes the operations take by reference.
    made = {'_p_VPxData': type('SampleData', (vpx.VPxData,), {})(),
            '_p_VPxEditData': type('SampleEdit', (vpx.VPxEditData,), {})()}
    yield made
    host.clear_log()


# What each override returns, by the kind of its C++ result, and what the host
# then receives.
KEEP = []


def returned(f):
    r = f.result
    if r.kind in ('value', 'reference'):
        value = python_class(r.target)()
        if r.kind == 'reference':
            KEEP.append(value)            # the host only borrows it
        return value
    return {'status': 'unknown', 'bool': True, 'void': None, 'pointer': None, 'chars': 'text',
            'string': 'text', 'string_array': ['one', 'two'],
            'scalar': 0.5 if r.target == 'double' else 3}[r.kind]


def received(f, value):
    r = f.result
    if r.kind == 'value':
        return value.id() if r.target == 'VTypeId' else 'value'
    if r.kind == 'reference':
        return int(value.this)
    return {'status': 5, 'bool': True, 'void': None, 'pointer': 0, 'chars': 'text',
            'string': 'text', 'string_array': ['one', 'two'],
            'scalar': 0.5 if r.target == 'double' else 3}[r.kind]


def python_arguments(f):
    return sum(1 for a in f.args if a.kind != 'status_out')


@pytest.mark.parametrize('cls', sorted(DIRECTORS))
def test_every_override_reaches_python_with_its_arguments_and_back(cls, samples):
    calls = []
    values = {}
    namespace = {}
    for _, f in DIRECTORS[cls]:
        # Overloads of one name may differ in their result: told by their count.
        values.setdefault((f.name, python_arguments(f)), returned(f))

        def method(self, *args, _name=f.name):
            calls.append((_name, len(args)))
            return values[_name, len(args)]
        namespace[f.name] = method
    obj = instance(cls, namespace)
    for k, f in DIRECTORS[cls]:
        del calls[:]
        assert host.drive_info(k)[:2] == (cls, f.name)
        outcome = host.drive(k, obj, samples)
        value = values[f.name, python_arguments(f)]
        assert outcome == ('ok', received(f, value), None), (f.qualified, outcome)
        assert calls == [(f.name, python_arguments(f))], f.qualified


@pytest.mark.parametrize('cls', sorted(DIRECTORS))
def test_without_overrides_the_host_defaults_answer(cls, samples):
    obj = instance(cls, {})
    abstract = any(f.pure for _, f in DIRECTORS[cls])
    for k, f in DIRECTORS[cls]:
        status, what, pending = host.drive(k, obj, samples)
        if not f.pure:
            # A default may itself use a pure operation, which then fails as below.
            if not abstract or status == 'ok' and pending is None:
                assert (status, pending) == ('ok', None), (f.qualified, what, pending)
            else:
                assert isinstance(pending, (TypeError, RuntimeError)), (f.qualified, what)
            continue
        # A pure operation has no default: Python reports the missing method
        # and the host gets the failure of its result kind.
        kind = f.result.kind
        if kind in ('scalar', 'value', 'reference', 'pointer', 'chars'):
            assert status == 'exception' and what.startswith('SWIG director type mismatch'), \
                (f.qualified, what)
        else:
            assert status == 'ok', (f.qualified, what)
            # Text the host could not get leaves its error behind, as it must.
            if kind in ('string', 'string_array'):
                assert isinstance(pending, TypeError), f.qualified
    del obj
    gc.collect()
