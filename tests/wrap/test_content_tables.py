"""The external-content tables: their getters fill lists in place and return
the principal string; the lists are rewritten before the status is looked at."""
import pytest

from openvorla import OpenVorlaVPx as vpx

PROTOTYPES = (
    "\nAdditional information:\n"
    "Wrong number or type of arguments for overloaded function "
    "'VExternalContentInfoTable_getEntryByIndex'.\n"
    "  Possible C/C++ prototypes are:\n"
    "    VExternalContentInfoTable::getEntryByIndex(unsigned int const,VStringArray &,"
    "VStringArray &,VStatus &)\n"
    "    VExternalContentInfoTable::getEntryByIndex(unsigned int const,VStringArray &,VString &,"
    "VStringArray &,VStatus &)\n")


@pytest.fixture
def table():
    t = vpx.VExternalContentInfoTable()
    assert t.addResolvedEntry('texture', 'a.png', '/abs/a.png', ['/root1', '/root2']) is None
    assert t.addUnresolvedEntry('cache', 'c.bin', 'shape1', []) is None
    return t


@pytest.mark.parametrize('before', [['x', 'y', 'z', 'w'], [], ['only']])
def test_lists_are_shortened_or_grown_in_place(table, before):
    first, second = list(before), list(before)
    alias = first
    assert table.getEntryByIndex(0, first, second) == 'texture'
    assert alias is first and first == ['a.png', '/abs/a.png'] and second == ['/root1', '/root2']


def test_the_longer_form_takes_a_context(table):
    first, second = [], ['stale']
    assert table.getInfoByKey('cache', first, 'shape1', second) == 'cache'
    assert first == ['c.bin', ''] and second == []


def test_a_failing_status_still_rewrites_the_lists(table):
    first, second = ['stale'], ['stale']
    with pytest.raises(RuntimeError) as e:
        table.getEntryByIndex(7, first, second)
    assert str(e.value) == 'No external content entry at that index'
    assert (first, second) == ([], [])
    first = ['stale']
    with pytest.raises(RuntimeError) as e:
        table.getInfoByKey('cache', first, 'other', ['x'])
    assert str(e.value) == "The entry 'cache' does not belong to 'other'" and first == []


def test_a_tuple_is_refused_after_the_host_ran(table):
    first = ['stale']
    with pytest.raises(TypeError) as e:
        table.getEntryByIndex(0, first, ('not', 'a', 'list'))
    assert str(e.value) == 'Argument 4 must be a list object' + PROTOTYPES
    assert first == ['a.png', '/abs/a.png']   # rewritten before the refusal


def test_counts_choose_the_form(table):
    with pytest.raises(TypeError) as e:
        table.getEntryByIndex(0, [])
    assert str(e.value) == PROTOTYPES[len('\nAdditional information:\n'):]


def test_adding_entries_reports_the_host_status(table):
    with pytest.raises(RuntimeError) as e:
        table.addResolvedEntry('texture', 'b.png', '/b.png', [])
    assert str(e.value) == "The external content key 'texture' is already in the table"
    assert table.length() == 2


def test_location_table():
    t = vpx.VExternalContentLocationTable()
    assert t.addEntry('texture', '/new/a.png') is None
    assert t.getLocationByKey('texture') == '/new/a.png'
    found = ['x', 'y']
    assert t.getEntryByIndex(0, found) == 'texture' and found == ['/new/a.png']
    with pytest.raises(RuntimeError) as e:
        t.getLocationByKey('nothing')
    assert str(e.value) == "No location for 'nothing'"
    with pytest.raises(TypeError) as e:
        t.getEntryByIndex(0, ('x',))
    assert str(e.value) == 'Argument 3 must be a list object'
