"""The value classes of OpenVorla as Python values: each protocol is checked
on every class the model gives it (lengths and items, writes, the sequences
that stand for objects, reprs, hashes, operators), then the strict checks of
strings, booleans and numbers on every argument that has them."""
import copy
import math
import os

import numpy as np
import pytest

from openvorla import OpenVorla as ov, _OpenVorla

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))


def model(name):
    from codegen.__main__ import load_module
    return load_module(os.path.join(ROOT, 'wrap', f'{name}.toml'),
                       [os.path.join(ROOT, 'host', 'include')])


MODEL = model('OpenVorla')
SHAPED = [c for c in MODEL.classes if c.protocols.shape]
READ = [c for c in SHAPED if c.protocols.shape.reader]
NAMESPACE = {k: v for k, v in vars(ov).items() if isinstance(v, type)}


def shape(c):
    return c.protocols.shape


def sample(c):
    """An object of a shaped class and the items Python is to see in it."""
    s, cls = shape(c), getattr(ov, c.name)
    if s.kind == 'components':
        items = [0.25 * (k + 1) for k in range(s.size)]
        return cls(*items), items
    if s.kind == 'grid':
        rows = [[float(r * s.dims[1] + k) for k in range(s.dims[1])] for r in range(s.dims[0])]
        return cls(rows), [tuple(r) for r in rows]
    element = s.element
    if element.number:
        items = [1, 2, 3] if element.cpp == 'int' else [0.5, 1.5, 2.5]
    elif element.sequence:
        items = [getattr(ov, element.cpp)(k, k + 1, k + 2) for k in range(3)]
    else:
        items = [getattr(ov, element.cpp)() for _ in range(3)]
    obj = cls()
    for item in items:
        obj.append(item)
    return obj, items


def same(a, b):
    """Items compare by value, or (handles without a way to tell their copies
    apart in Python) by their repr."""
    return a == b or repr(a) == repr(b)


@pytest.mark.parametrize('c', SHAPED, ids=lambda c: c.name)
def test_length_items_negative_indices_and_slices(c):
    obj, items = sample(c)
    n = c.name
    assert len(obj) == len(items)
    assert all(same(obj[i], items[i]) and same(obj[i - len(items)], items[i])
               for i in range(len(items)))
    assert all(same(a, b) for a, b in zip(obj[::-2], items[::-2]))
    assert len(obj[::-2]) == len(items[::-2])
    for key in (len(items), -len(items) - 1, 2 ** 70):
        with pytest.raises(IndexError) as e:
            obj[key]
        assert str(e.value) == f'{n} index out of range'
    with pytest.raises(TypeError) as e:
        obj['0']
    what = 'integers, slices or pairs of integers' if shape(c).kind == 'grid' else \
        'integers or slices'
    assert str(e.value) == f'{n} indices must be {what}, not str'


@pytest.mark.parametrize('c', SHAPED, ids=lambda c: c.name)
def test_iteration(c):
    obj, items = sample(c)
    assert all(same(a, b) for a, b in zip(iter(obj), items)) and len(list(obj)) == len(items)
    assert len(list(reversed(obj))) == len(items)


@pytest.mark.parametrize('c', [c for c in SHAPED if shape(c).assign], ids=lambda c: c.name)
def test_items_are_written_in_place(c):
    obj, items = sample(c)
    s = shape(c)
    if s.kind == 'grid':
        obj[1, -1] = 42
        assert obj[1][-1] == obj[1, s.dims[1] - 1] == 42.0
        with pytest.raises(TypeError) as e:
            obj[0] = items[0]
        assert str(e.value) == f'{c.name} indices must be pairs of integers, not int'
        return
    value = items[0] if not s.element.number else 7
    obj[-1] = value
    assert same(obj[len(items) - 1], value)
    with pytest.raises(IndexError):
        obj[len(items)] = value
    with pytest.raises(TypeError) as e:
        obj[0:1] = [value]
    assert str(e.value) == f'{c.name} indices must be integers, not slice'
    with pytest.raises(TypeError) as e:
        obj[0] = 'x'
    assert str(e.value) == s.value.message


@pytest.mark.parametrize('c', READ, ids=lambda c: c.name)
def test_sequences_of_the_shape_stand_for_objects(c):
    obj, items = sample(c)
    cls = getattr(ov, c.name)
    plain = [list(i) if isinstance(i, tuple) else list(i) if shape(c).element.sequence else i
             for i in items]
    for made in (cls(plain), cls(tuple(plain)), cls(obj), cls(np.array(plain))):
        assert len(made) == len(obj) and all(same(a, b) for a, b in zip(made, obj))
    copy_ctor = next(a for cand in c.constructor.candidates for a in cand.args
                     if a.sequence == shape(c).reader)
    for wrong in ('abc', {1: 2}, [plain, plain] if shape(c).kind != 'array' else [object()]):
        with pytest.raises(TypeError) as e:
            cls(wrong)
        assert str(e.value).startswith(copy_ctor.message)
    with pytest.raises(ValueError):
        cls(None)


def test_the_counts_the_constructors_take():
    assert list(ov.VPoint([1, 2])) == [1.0, 2.0, 0.0, 1.0]
    assert list(ov.VVector((1, 2))) == [1.0, 2.0, 0.0]
    assert list(ov.VColor([1, 0, 0])) == [1.0, 0.0, 0.0, 1.0]
    for wrong in ([1], [1, 2, 3, 4, 5]):
        with pytest.raises(TypeError):
            ov.VPoint(wrong)
    with pytest.raises(TypeError):
        ov.VMatrix([[1, 0, 0, 0]] * 3)


def test_parameters_take_sequences_and_numpy():
    points = ov.VPointArray()
    points.append([1, 2, 3])
    points.append(np.array([4.0, 5.0, 6.0, 2.0]))
    points.append(ov.VVector(7, 8, 9))      # a vector is a sequence of three numbers
    assert [list(p) for p in points] == [[1, 2, 3, 1], [4, 5, 6, 2], [7, 8, 9, 1]]
    assert ov.VPoint(0, 0, 0).distanceTo((3, 4, 0)) == 5.0
    assert ov.VBoundingBox([0, 0, 0], [1, 2, 3]).depth() == 3.0
    xyz = np.arange(12.0).reshape(4, 3)
    assert np.array_equal(np.array(ov.VPointArray(xyz))[:, :3], xyz)
    assert np.array(ov.VPointArray(xyz)).shape == (4, 4)
    # Other dtypes and strides go number by number.
    assert list(ov.VDoubleArray(np.arange(6, dtype=np.float32)[::2])) == [0.0, 2.0, 4.0]
    assert list(ov.VIntArray(np.arange(3))) == [0, 1, 2]
    assert ov.VMatrix(np.eye(4) * 2) == ov.VMatrix() * 2
    assert np.array_equal(np.array(ov.VMatrix(np.eye(4))), np.eye(4))


def test_the_arrays_the_host_fills_come_back_as_lists():
    m = ov.VMatrix([[1, 2, 3, 4]] * 4)
    assert m.get() == [list(row) for row in m] == [[1.0, 2.0, 3.0, 4.0]] * 4
    assert m(0, 3) == m[0, 3] == m[-1, -1] == 4.0
    with pytest.raises(IndexError) as e:
        m(4, 0)
    assert str(e.value) == 'VMatrix index out of range'
    with pytest.raises(OverflowError):
        m(-1, 0)


@pytest.mark.parametrize('c', [c for c in MODEL.classes if c.protocols.repr],
                         ids=lambda c: c.name)
def test_repr_shows_the_value(c):
    p = c.protocols
    if p.shape:
        obj, items = sample(c)
    else:
        obj = getattr(ov, c.name)() if c.name != 'VString' else ov.VString('a "b"')
    text = repr(obj)
    if p.repr.form in ('call', 'text') or (p.shape and p.shape.reader and (
            p.shape.element.number or p.shape.element.sequence)):
        # Python makes the object back from what it shows.
        again = eval(text, NAMESPACE)
        assert repr(again) == text and (not hasattr(obj, '__eq__') or same(again, obj))
    elif p.repr.form == 'state':
        labels = [part.label for part in p.repr.parts]
        assert text.startswith(f'<{c.name} {labels[0]}=') and text.endswith('>')
        assert all(f' {label}=' in text for label in labels)
    else:
        assert text.startswith(f'{c.name}([') and text.endswith('])')


def test_repr_texts():
    assert repr(ov.VPoint(1, 2, 3)) == 'VPoint(1.0, 2.0, 3.0, 1.0)'
    assert repr(ov.VTypeId(0x7A200)) == 'VTypeId(0x7a200)'
    assert repr(ov.VMatrix()) == ('VMatrix([[1.0, 0.0, 0.0, 0.0], [0.0, 1.0, 0.0, 0.0], '
                                  '[0.0, 0.0, 1.0, 0.0], [0.0, 0.0, 0.0, 1.0]])')
    assert repr(ov.VDoubleArray([0.5, 1.5])) == 'VDoubleArray([0.5, 1.5])'
    assert repr(ov.VDoubleArray(range(2000))) == \
        'VDoubleArray([0.0, 1.0, 2.0, ..., 1997.0, 1998.0, 1999.0])'
    assert repr(ov.VObject()) == '<VObject isNull=True apiType=0>'
    assert repr(ov.VPlug()) == "<VPlug isNull=True isElement=False logicalIndex=-1 name=''>"
    assert repr(ov.VTimeRange(ov.VTime(1.0), ov.VTime(2.0, ov.VTime.kMinutes))) == \
        'VTimeRange(VTime(1.0, 3), VTime(2.0, 2))'
    assert repr(ov.VString('tick')) == "VString('tick')"
    # A deleted object has no value to show.
    point = ov.VPoint()
    ov.VPoint.__swig_destroy__(point)
    assert repr(point).startswith('<openvorla.OpenVorla.VPoint; proxy of ')


HASHED = [c for c in MODEL.classes if c.protocols.hash is not None or c.protocols.text]


@pytest.mark.parametrize('c', HASHED, ids=lambda c: c.name)
def test_hashable_values_hash_as_their_equals(c):
    cls = getattr(ov, c.name)
    made = {'VTypeId': lambda: cls(0x7A200), 'VString': lambda: cls('key'),
            'VTimeRange': lambda: cls(ov.VTime(1.0), ov.VTime(2.0))}.get(c.name, cls)
    a = made()
    b = cls(a)
    assert a == b and a is not b and hash(a) == hash(b)
    assert {a: 'value'}[b] == 'value'


def test_hashes_of_host_objects_and_text():
    empty = [ov.VTimeRange(ov.VTime(2.0), ov.VTime(1.0)), ov.VTimeRange(ov.VTime(5.0), ov.VTime(0.0))]
    assert empty[0] == empty[1] and hash(empty[0]) == hash(empty[1])
    assert ov.VString('a') == 'a' and hash(ov.VString('a')) == hash('a') and str(ov.VString('é')) == 'é'
    assert ov.VString('a') != 'b' and (ov.VString('a') == 1) is False
    assert len({ov.VTypeId(k) for k in (1, 2, 1)}) == 2


@pytest.mark.parametrize('c', [c for c in MODEL.classes if c.protocols.hash is None and
                               not c.protocols.text and
                               any(m.member == '__eq__' for m in c.members)],
                         ids=lambda c: c.name)
def test_values_python_can_change_are_unhashable(c):
    with pytest.raises(TypeError) as e:
        hash(getattr(ov, c.name)())
    assert str(e.value) == f"unhashable type: '{c.name}'"


def test_arithmetic():
    p, v, w = ov.VPoint(1, 2, 3), ov.VVector(1, 0, 0), ov.VVector(0, 1, 0)
    assert p + v == ov.VPoint(2, 2, 3) and p - v == ov.VPoint(0, 2, 3)
    assert p - ov.VPoint(1, 1, 1) == ov.VVector(0, 1, 2)
    assert v * 2 == 2 * v == ov.VVector(2, 0, 0) and v / 2 == ov.VVector(0.5, 0, 0)
    assert v * w == 0.0 and v ^ w == ov.VVector(0, 0, 1) and -v == ov.VVector(-1, 0, 0)
    m = ov.VMatrix([[1, 0, 0, 0], [0, 1, 0, 0], [0, 0, 1, 0], [10, 20, 30, 1]])
    assert p * m == ov.VPoint(11, 22, 33) and v * m == v
    assert m * m == ov.VMatrix(np.array(m) @ np.array(m)) and 2 * m == m * 2 == m + m
    assert m - m == ov.VMatrix(np.zeros((4, 4)))
    q = ov.VQuaternion(math.pi / 2, ov.VVector(0, 0, 1))
    assert (q * q).isEquivalent(ov.VQuaternion(math.pi, ov.VVector(0, 0, 1)))
    assert ov.VColor(1, 0, 0) + ov.VColor(0, 1, 0) == ov.VColor(1, 1, 0, 2)
    assert 0.5 * ov.VColor(1, 1, 1) == ov.VColor(0.5, 0.5, 0.5, 0.5)
    assert ov.VTime(1.0) < ov.VTime(1001.0, ov.VTime.kMilliseconds) <= ov.VTime(2.0)
    mask = ov.VSelectionMask(ov.VSelectionMask.kSelectMeshes) | ov.VSelectionMask(
        ov.VSelectionMask.kSelectJoints)
    assert mask.intersects(ov.VSelectionMask.kSelectJoints)
    # a += b makes a new value, as for Python's own numbers.
    before = v
    v += w
    assert v == ov.VVector(1, 1, 0) and before == ov.VVector(1, 0, 0)


OPERATORS = [(c, m) for c in MODEL.classes for m in c.members if m.protocol == 'operator']


@pytest.mark.parametrize('c, m', OPERATORS, ids=lambda x: getattr(x, 'entry', ''))
def test_other_operands_are_for_python(c, m):
    obj = sample(c)[0] if c.protocols.shape else getattr(ov, c.name)()
    for other in ([] if c.protocols.text else ['x']) + [None, object(), [1.0, 2.0, 3.0]]:
        assert getattr(obj, m.member)(other) is NotImplemented


def test_special_methods_count_their_arguments():
    with pytest.raises(TypeError) as e:
        ov.VPoint.__getitem__(ov.VPoint())
    assert str(e.value) == 'VPoint___getitem__ expected 2 arguments, got 1'
    with pytest.raises(TypeError) as e:
        ov.VMatrix()(1, 2, 3)
    assert str(e.value) == 'VMatrix___call__ expected 3 arguments, got 4'
    with pytest.raises(TypeError) as e:
        _OpenVorla.VPoint___add__()
    assert str(e.value) == 'VPoint___add__ expected 2 arguments, got none'


def test_unsupported_operands_raise_as_python_does():
    with pytest.raises(TypeError) as e:
        ov.VPoint() + 'x'
    assert str(e.value) == "unsupported operand type(s) for +: 'VPoint' and 'str'"
    with pytest.raises(TypeError) as e:
        ov.VTime() < 1
    assert str(e.value) == "'<' not supported between instances of 'VTime' and 'int'"


# --- strict arguments ---------------------------------------------------------------

def valid(a):
    if a.kind == 'scalar':
        return {'AsStrictBool': True, 'AsNumberDouble': 0.5, 'AsNumberFloat': 0.5}.get(
            a.converter, 0)
    if a.kind in ('string', 'string_ptr', 'chars'):
        return 'text'
    if a.kind == 'object' and a.descriptor is not None:
        cls = getattr(ov, a.descriptor.name[len('_p_'):], None)
        if cls is not None:
            try:
                return cls()
            except Exception:
                return None
    return None


def calls(kind, converter=None):
    """(entry point, its one candidate, the argument) for every argument of
    a kind on an entry point without overloads, called on a plain object."""
    out = []
    for c in MODEL.classes:
        for ep in ([c.constructor] if c.constructor else []) + c.members:
            if len(ep.candidates) != 1 or ep.protocol:
                continue
            for a in ep.candidates[0].args:
                if a.kind == kind and a.slot is not None and \
                        (converter is None or a.converter == converter):
                    out.append((ep, ep.candidates[0], a))
    return out


def call(ep, cand, a, value):
    args = [valid(x) for x in sorted((x for x in cand.args if x.slot is not None),
                                     key=lambda x: x.slot)]
    missing = [x for x in cand.args if x.slot is not None and x is not a and x.kind == 'object'
               and args[x.slot] is None and x.reference]
    if missing:
        pytest.skip('no object to call it with')
    args[a.slot] = value
    getattr(_OpenVorla, ep.entry)(*args)


@pytest.mark.parametrize('ep, cand, a', calls('string'), ids=lambda x: getattr(x, 'entry', ''))
def test_a_wrong_string_stops_the_call(ep, cand, a):
    for wrong in (5, None, b'bytes', ['text']):
        with pytest.raises(TypeError) as e:
            call(ep, cand, a, wrong)
        assert str(e.value) == a.message == \
            f"in method '{ep.entry}', argument {a.number} of type '{a.spelling}'"


@pytest.mark.parametrize('ep, cand, a', calls('scalar', 'AsStrictBool'),
                         ids=lambda x: getattr(x, 'entry', ''))
def test_a_boolean_is_a_bool(ep, cand, a):
    for wrong in ([1], 'yes', None, 1):
        with pytest.raises(TypeError) as e:
            call(ep, cand, a, wrong)
        assert str(e.value) == a.message
    try:
        call(ep, cand, a, np.bool_(False))
    except RuntimeError:   # the host's own refusal: the argument passed
        pass


def test_numbers_are_what_number_protocols_make_numbers_of():
    assert list(ov.VPoint(np.float32(0.5), np.int64(2), True)) == [0.5, 2.0, 1.0, 1.0]
    assert ov.VTypeId(np.uint32(7)).id() == 7
    for wrong in ('1', [1.0], np.array([1.0])):
        with pytest.raises(TypeError) as e:
            ov.VTime(wrong)
        assert "overloaded function 'new_VTime'" in str(e.value)
    with pytest.raises(TypeError):
        ov.VTypeId(1.5)


def test_the_examples_of_misuse_raise():
    with pytest.raises(TypeError) as e:
        ov.VFileObject().setRawFullName(5)
    assert str(e.value) == "in method 'VFileObject_setRawFullName', argument 2 of type 'VString const &'"
    with pytest.raises(TypeError) as e:
        ov.VArgList().addArg([1])
    assert "Wrong number or type of arguments for overloaded function 'VArgList_addArg'" in str(e.value)
    args = ov.VArgList()
    for value in (True, 2, 2.5, 'x', ov.VString('y')):
        args.addArg(value)
    assert [args.asString(i) for i in range(args.length())] == ['true', '2', '2.5', 'x', 'y']
    with pytest.raises(TypeError) as e:
        ov.VFnNumericAttribute().create(123, 'o', ov.VFnNumericData.kDouble, 0.0)
    assert str(e.value) == "in method 'VFnNumericAttribute_create', argument 2 of type 'VString const &'"


# --- hostile sequences ----------------------------------------------------------------

class Lying:
    """A sequence whose length and items disagree, and whose items raise."""
    def __init__(self, n, fail=None):
        self.n, self.fail = n, fail

    def __len__(self):
        return self.n

    def __getitem__(self, i):
        if i == self.fail:
            raise ZeroDivisionError('item')
        if i >= 3:
            raise IndexError(i)
        return float(i)


def test_hostile_sequences_raise_and_never_crash():
    loop = []
    loop.append(loop)
    for cls in (ov.VPointArray, ov.VDoubleArray, ov.VPoint, ov.VMatrix):
        with pytest.raises(TypeError):
            cls(loop)
        with pytest.raises(TypeError):
            cls(Lying(3, fail=1))
    assert list(ov.VDoubleArray(Lying(10))) == [0.0, 1.0, 2.0]   # what iteration gives
    with pytest.raises(MemoryError) as e:
        ov.VDoubleArray(range(2 ** 33))
    assert str(e.value) == "in method 'new_VDoubleArray', argument 1 of type 'VDoubleArray const &'"
    with pytest.raises(TypeError):
        ov.VDoubleArray(np.zeros((2, 2)))
    a = ov.VDoubleArray([1.0])
    assert copy.copy(a) is not None and a[0] == 1.0
