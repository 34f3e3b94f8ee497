"""The eight pointer classes: a heap cell of one scalar."""
import pytest

from openvorla import OpenVorlaVPx as vpx, _OpenVorlaVPx as m

CLASSES = {'charPtr': '\0', 'intPtr': 0, 'shortPtr': 0, 'floatPtr': 0.0, 'doublePtr': 0.0,
           'boolPtr': False, 'uIntPtr': 0, 'uCharPtr': 0}


@pytest.mark.parametrize('cls, zero', CLASSES.items())
def test_new_cells_read_zero_and_own_their_cell(cls, zero):
    cell = getattr(vpx, cls)()
    assert cell.value() == zero and type(cell.value()) is type(zero)
    assert cell.thisown


def test_cast_and_frompointer_address_the_same_cell():
    cell = vpx.intPtr()
    cell.assign(-7)
    plain = cell.cast()
    assert 'int *' in repr(plain)
    again = vpx.intPtr.frompointer(plain)
    assert int(again.this) == int(cell.this) and not again.thisown
    again.assign(42)
    assert cell.value() == 42


def test_char_cell_holding_a_byte_that_is_not_utf8():
    cell = vpx.charPtr()
    cell.assign(-23)    # the byte 0xE9
    value = cell.value()
    assert value == '\udce9' and value.encode('utf-8', 'surrogateescape') == b'\xe9'


def test_messages():
    with pytest.raises(TypeError) as e:
        m.intPtr_assign(vpx.uIntPtr(), 1)
    assert str(e.value) == "in method 'intPtr_assign', argument 1 of type 'intPtr *'"
    with pytest.raises(TypeError) as e:
        m.intPtr_frompointer(vpx.uIntPtr())
    assert str(e.value) == "in method 'intPtr_frompointer', argument 1 of type 'int *'"
    with pytest.raises(TypeError) as e:
        m.delete_charPtr(vpx.intPtr())
    assert str(e.value) == "in method 'delete_charPtr', argument 1 of type 'charPtr *'"


def test_delete_takes_ownership_away():
    cell = vpx.doublePtr()
    wrapper = cell.this
    m.delete_doublePtr(cell)
    assert wrapper.own() is False
