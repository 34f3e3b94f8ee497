"""What the model makes of value classes for Python's data model, on the
fixture SDK's values module and on small headers: shapes, operators, reprs,
hashes, the sequences that stand for objects, and strict arguments."""
import os

import pytest

from codegen import manifest as manifest_mod
from codegen import model as model_mod
from codegen import parse as parse_mod

HERE = os.path.dirname(__file__)
INCLUDE = os.path.join(HERE, 'fixtures', 'include')


@pytest.fixture(scope='module')
def values():
    m = manifest_mod.load(os.path.join(HERE, 'fixtures', 'values.toml'), 'values.toml')
    headers = parse_mod.parse([c.header for c in m.classes], [INCLUDE], m.namespace)
    return {c.name: c for c in model_mod.build(m, headers).classes}


def build(tmp_path, header, classes, keys='value_protocols = true\nstrict_scalars = true\n'):
    entries = ', '.join(f'{{ name = "{c}", family = "f", director = false, header = "sdk/H.h" }}'
                        for c in classes)
    (tmp_path / 'm.toml').write_text(f'[module]\nname = "_M"\nproxy = "M"\nnamespace = "S"\n'
                                     f'{keys}classes = [{entries}]\n')
    (tmp_path / 'sdk').mkdir(exist_ok=True)
    (tmp_path / 'sdk' / 'H.h').write_text('#pragma once\nnamespace S {\nclass VString { public: VString(); };\n'
                                          'class VStatus { public: VStatus(); };\n'
                                          + header + '\n}\n')
    m = manifest_mod.load(str(tmp_path / 'm.toml'), 'm.toml')
    headers = parse_mod.parse([c.header for c in m.classes], [str(tmp_path)], m.namespace)
    return {c.name: c for c in model_mod.build(m, headers).classes}


def special(cls):
    return {m.member: m for m in cls.members if m.protocol}


def test_shapes_of_components_grids_and_arrays(values):
    pair = values['Pair'].protocols.shape
    assert (pair.kind, pair.size, pair.fields, pair.counts, pair.assign) == (
        'components', 2, ['a', 'b'], (1, 2), 'index')
    assert (pair.reader, pair.numbers) == ('SequenceTo_Pair', 'NumbersTo_Pair')
    grid = values['Grid'].protocols.shape
    assert (grid.kind, grid.dims, grid.assign, grid.reader) == ('grid', (2, 2), 'index',
                                                                'SequenceTo_Grid')
    array = values['PairArray'].protocols.shape
    assert (array.kind, array.length, array.append, array.checked) == (
        'array', 'length', 'append', (True, False))
    # Its elements are pairs, which a sequence of numbers stands for, and a
    # buffer of rows of doubles makes through the pair's own maker.
    assert (array.element.cpp, array.element.sequence, array.element.numbers) == (
        'Pair', 'SequenceTo_Pair', 'NumbersTo_Pair')
    assert values['Tag'].protocols.shape is None


def test_a_length_that_is_no_count_makes_no_array(tmp_path):
    classes = build(tmp_path, '''
class Arrow { public: Arrow(); double operator[](unsigned int i) const; double length() const; };
class Bag { public: Bag(); double operator[](unsigned int i) const; unsigned int length() const; };
''', ['Arrow', 'Bag'])
    assert classes['Arrow'].protocols.shape is None
    bag = classes['Bag'].protocols.shape
    # Read-only, and without append no sequence stands for one.
    assert (bag.kind, bag.assign, bag.reader) == ('array', '', '')
    assert '__setitem__' not in special(classes['Bag'])


def test_sequence_entry_points_and_their_python_forms(values):
    pair = special(values['Pair'])
    assert [m.member for m in pair.values()] == [
        '__len__', '__getitem__', '__iter__', '__setitem__', '__add__', '__neg__', '__mul__',
        '__rmul__', '__mod__', '__repr__']
    assert [f.describe('Values') for f in pair['__getitem__'].forms] == [
        '__getitem__(index: int) -> float', '__getitem__(index: slice) -> list[float]']
    assert pair['__iter__'].forms[0].describe('Values') == '__iter__() -> Iterator[float]'
    assert pair['__setitem__'].candidates == [] and \
        values['Pair'].protocols.shape.value.message == \
        "in method 'Pair___setitem__', argument 3 of type 'double'"
    grid = special(values['Grid'])
    assert grid['__getitem__'].forms[0].describe('Values') == \
        '__getitem__(index: tuple[int, int]) -> float'
    (call,) = grid['__call__'].candidates
    assert call.operator == 'call' and [a.spelling for a in call.args[1:]] == [
        'unsigned int', 'unsigned int']


def test_operators_their_forms_and_what_is_left_to_python(values):
    ops = special(values['Pair'])
    assert [(c.operator, c.args[1].spelling) for c in ops['__mul__'].candidates] == [
        ('member', 'double'), ('member', 'Grid const &')]
    # The number times a pair declared outside the class; the commuted member
    # form would take the same operand and is left out.
    assert [(c.operator, c.call) for c in ops['__rmul__'].candidates] == [
        ('reflected', 'operator*')]
    assert [(c.operator, c.result.kind) for c in ops['__mod__'].candidates] == [('free', 'scalar')]
    assert ops['__neg__'].protocol == 'unary' and ops['__neg__'].flags == model_mod.METH_O
    # a += b is Python's a = a + b: compound assignments are not bound.
    assert '__iadd__' not in ops and '__add__' in ops
    assert [c.operator for c in special(values['Tag'])['__lt__'].candidates] == ['member']


def test_a_number_times_a_value_commutes_without_a_free_operator(tmp_path):
    classes = build(tmp_path, '''
class V { public: V(); V operator*(double s) const; V operator*(const V &o) const;
          V operator/(double s) const; };
''', ['V'])
    ops = special(classes['V'])
    assert [(c.operator, c.args[1].spelling) for c in ops['__rmul__'].candidates] == [
        ('commuted', 'double')]
    assert '__rtruediv__' not in ops


def test_reprs(values):
    forms = {n: (c.protocols.repr.form if c.protocols.repr else None) for n, c in values.items()}
    assert forms == {'Pair': 'call', 'Grid': 'shape', 'PairArray': 'shape', 'Tag': 'call',
                     'Handle': 'state', 'Labels': None, 'VString': 'text'}
    assert [(p.label, p.expr) for p in values['Pair'].protocols.repr.parts] == [('a', 'a'),
                                                                                 ('b', 'b')]
    (tag,) = values['Tag'].protocols.repr.parts
    assert (tag.expr, tag.hexadecimal) == ('id()', True)
    # What a handle reads, where each part shows as a value.
    assert [p.label for p in values['Handle'].protocols.repr.parts] == [
        'isNull', 'weight', 'tag', 'name']


def test_hashes_read_what_equal_objects_read_alike(values):
    hashes = {n: c.protocols.hash for n, c in values.items()}
    assert [p.label for p in hashes['Tag']] == ['id']
    # Not the weight (compared with tolerance elsewhere) nor the name (text).
    assert [(p.label, p.hash) for p in hashes['Handle']] == [('isNull', ''), ('tag', 'Hash_Tag')]
    # Python can change a pair: no hash, whatever its ==.
    assert hashes['Pair'] is None and hashes['Labels'] is None
    assert '__hash__' in special(values['VString']) and values['VString'].protocols.text


def test_sequences_stand_for_objects_where_they_are_taken(values):
    labels = {m.member: m for m in values['Labels'].members}
    (place,) = labels['place'].candidates
    where = place.args[1]
    assert (where.sequence, where.value_type) == ('SequenceTo_Pair', 'Pair')
    assert place.python.describe('Values') == (
        'place(where: Pair | Sequence[float], prefix: str | None = None) -> Pair')
    # A pair the host writes into is the caller's object, never a sequence.
    (grow,) = labels['grow'].candidates
    assert grow.args[1].sequence == ''
    # An operand is taken as it is, so that Python tries the other one.
    add = special(values['Pair'])['__add__'].candidates[0]
    assert add.args[1].sequence == ''
    grid = values['Grid'].constructor.candidates[1].args[0]
    assert (grid.numbers, grid.shape) == (('double', 'AsNumberDouble'), (2, 2))


def test_arrays_the_host_fills_come_back(values):
    get = {m.member: m for m in values['Grid'].members}['get']
    (cand,) = get.candidates
    dest = cand.args[1]
    assert (dest.kind, dest.slot, dest.shape) == ('array_out', None, (2, 2))
    assert cand.python.describe('Values') == 'get() -> list[list[float]]'


def test_strict_arguments(values):
    labels = {m.member: m for m in values['Labels'].members}
    (add,) = labels['add'].candidates
    label, visible = add.args[1:]
    assert (label.kind, label.strict) == ('string', True)
    assert label.message == "in method 'Labels_add', argument 2 of type 'VString const &'"
    assert visible.converter == 'AsStrictBool'
    (set_,) = labels['set'].candidates
    assert set_.args[1].message == "in method 'Labels_set', argument 2 of type 'VStringArray const &'"
    prefix = labels['place'].candidates[0].args[2]
    assert (prefix.kind, prefix.strict) == ('string_ptr', True)
    assert values['Pair'].constructor.candidates[1].args[0].converter == 'AsNumberDouble'


def test_without_the_keys_nothing_changes(tmp_path):
    header = '''class P { public: P(); P(double x, double y = 0);
    double operator[](unsigned int i) const; P operator+(const P &o) const;
    bool operator==(const P &o) const; void name(const VString &n, bool flag); double x; double y; };'''
    plain = build(tmp_path, header, ['P'], keys='')['P']
    assert plain.protocols is None and not any(m.protocol for m in plain.members)
    (name,) = {m.member: m for m in plain.members}['name'].candidates
    assert (name.args[1].strict, name.args[2].converter) == (False, 'AsBool')
    assert name.args[1].message == 'Expected a String or Unicode object for argument 2'
