"""Scalar and enumeration arguments: what each kind accepts, its ranges, and
the exception and message of each failure. The pointer classes' assign and
value reach every scalar routine, one kind per class."""
import math

import pytest

from openvorla import _OpenVorlaVPx as m


def assign_error(cls, value):
    cell = getattr(m, f'new_{cls}')()
    with pytest.raises(Exception) as e:
        getattr(m, f'{cls}_assign')(cell, value)
    return type(e.value), str(e.value)


def round_trip(cls, value):
    cell = getattr(m, f'new_{cls}')()
    getattr(m, f'{cls}_assign')(cell, value)
    return getattr(m, f'{cls}_value')(cell)


@pytest.mark.parametrize('cls, value, error, ctype', [
    ('intPtr', 2147483648, OverflowError, 'int'),
    ('intPtr', -2147483649, OverflowError, 'int'),
    ('intPtr', 3.0, TypeError, 'int'),
    ('intPtr', '1', TypeError, 'int'),
    ('uIntPtr', -1, OverflowError, 'unsigned int'),
    ('uIntPtr', 4294967296, OverflowError, 'unsigned int'),
    ('shortPtr', 32768, OverflowError, 'short'),
    ('shortPtr', -32769, OverflowError, 'short'),
    ('uCharPtr', 256, OverflowError, 'unsigned char'),
    ('uCharPtr', -1, OverflowError, 'unsigned char'),
    ('charPtr', 128, OverflowError, 'char'),
    ('charPtr', 'é', TypeError, 'char'),
    ('charPtr', 'ab', TypeError, 'char'),
    ('doublePtr', 10 ** 400, TypeError, 'double'),
    ('doublePtr', '1.0', TypeError, 'double'),
    ('floatPtr', 1e39, OverflowError, 'float'),
    ('floatPtr', -1e39, OverflowError, 'float'),
])
def test_refused_values(cls, value, error, ctype):
    assert assign_error(cls, value) == (error, f"in method '{cls}_assign', argument 2 of type '{ctype}'")


@pytest.mark.parametrize('cls, value, expected', [
    ('intPtr', -2147483648, -2147483648), ('intPtr', 2147483647, 2147483647),
    ('intPtr', True, 1),
    ('uIntPtr', 4294967295, 4294967295),
    ('shortPtr', -32768, -32768), ('shortPtr', 32767, 32767),
    ('uCharPtr', 255, 255),
    ('charPtr', 'a', 'a'), ('charPtr', '', '\0'), ('charPtr', 65, 'A'), ('charPtr', -128, '\udc80'),
    ('doublePtr', True, 1.0), ('doublePtr', 3, 3.0), ('doublePtr', 0.1, 0.1),
    ('floatPtr', 3.4028234663852886e38, 3.4028234663852886e38),
    ('floatPtr', math.inf, math.inf), ('floatPtr', -math.inf, -math.inf),
    ('boolPtr', [], False), ('boolPtr', [0], True), ('boolPtr', None, False), ('boolPtr', 'x', True),
])
def test_accepted_values(cls, value, expected):
    result = round_trip(cls, value)
    assert result == expected and type(result) is type(expected)


def test_float_narrows_nan_and_rounds():
    assert math.isnan(round_trip('floatPtr', math.nan))
    narrowed = round_trip('floatPtr', 0.1)
    assert narrowed == pytest.approx(0.1, rel=1e-7) and narrowed != 0.1


def test_a_failing_truth_test_is_a_type_error():
    class Undecided:
        def __bool__(self):
            raise ValueError('no truth here')
    assert assign_error('boolPtr', Undecided()) == (
        TypeError, "in method 'boolPtr_assign', argument 2 of type 'bool'")


def test_enumerations_take_any_32_bit_integer(matrix, quaternion):
    # 12345 is no space at all: the conversion lets it through and the host refuses it.
    with pytest.raises(RuntimeError):
        matrix.rotateTo(quaternion, 12345)
    with pytest.raises(OverflowError) as e:
        matrix.rotateTo(quaternion, 2 ** 31)
    assert str(e.value) == "in method 'VPxTransformationMatrix_rotateTo', argument 3 of type 'VSpace::Space'"


def test_results(matrix):
    assert m.VPxNode_className() == 'VPxNode'
    m.VFnPlugin_setRegisteringCallableScript()
    assert m.VFnPlugin_registeringCallableScript() is True
    assert m.VFnPlugin_registeringCallableScript() is False   # reading it clears it
    order = matrix.getRotationOrder()
    assert type(order) is int
