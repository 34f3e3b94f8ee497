"""What the model decides, on the fixture SDK."""
import os

import pytest

from codegen import manifest as manifest_mod
from codegen import model as model_mod
from codegen import parse as parse_mod
from codegen.model import METH_NOARGS, METH_O, METH_VARARGS, CType, pointer_descriptor_name, spell

HERE = os.path.dirname(__file__)
FIXTURES = os.path.join(HERE, 'fixtures')
INCLUDE = os.path.join(FIXTURES, 'include')


def build(manifest_text=None, header_text=None, tmp_path=None):
    if manifest_text is None:
        path, include = os.path.join(FIXTURES, 'fixture.toml'), INCLUDE
    else:
        (tmp_path / 'm.toml').write_text(manifest_text)
        (tmp_path / 'sdk').mkdir(exist_ok=True)
        (tmp_path / 'sdk' / 'Base.h').write_text(header_text)
        path, include = str(tmp_path / 'm.toml'), str(tmp_path)
    m = manifest_mod.load(path, 'fixture.toml')
    headers = parse_mod.parse([c.header for c in m.classes], [include], m.namespace)
    return model_mod.build(m, headers)


@pytest.fixture(scope='module')
def fixture():
    return build()


def test_descriptors_sorted_by_bytes_with_manifest_types(fixture):
    names = [d.name for d in fixture.descriptors]
    assert names == sorted(names, key=str.encode)
    assert [d.index for d in fixture.descriptors] == list(range(len(names)))
    # Pointer parameters bring _p_VStatus, _p_VString and _p_char; strings and
    # string arrays passed by value or reference bring none.
    assert names == ['_p_Abstract', '_p_Helper', '_p_Hidden', '_p_Mesh', '_p_Node', '_p_Pair', '_p_Pod',
                     '_p_Root', '_p_Shape', '_p_VStatus', '_p_VString', '_p_Value', '_p_char',
                     '_p_int', '_p_intPtr']
    assert {d.name: d.readable for d in fixture.descriptors}['_p_Value'] == 'Value *'


def test_cast_lists_hold_every_descendant(fixture):
    casts = {d.name: d.casts for d in fixture.descriptors}
    assert [c.source.name for c in casts['_p_Node']] == ['_p_Mesh', '_p_Shape']
    assert [c.source.name for c in casts['_p_Shape']] == ['_p_Mesh']
    # Classes the headers declare convert by static_cast; the rest pass unchanged.
    mesh_to_node = casts['_p_Node'][0]
    assert (mesh_to_node.derived_cpp, mesh_to_node.base_cpp) == ('Mesh', 'Node')
    helper = casts['_p_Root'][0]
    assert helper.source.name == '_p_Helper' and helper.derived_cpp is None
    assert [c.source.name for c in casts['_p_int']] == ['_p_intPtr']


def test_manifest_may_not_repeat_a_derived_type(tmp_path):
    text = open(os.path.join(FIXTURES, 'fixture.toml')).read() + ''
    text = text.replace('[types]\n', '[types]\n_p_Node = "Node *"\n')
    with pytest.raises(model_mod.GeneratorError, match='the headers derive these types; remove them from the manifest: _p_Node'):
        build(text, open(os.path.join(INCLUDE, 'sdk', 'Base.h')).read(), tmp_path)


def test_constants_first_class_with_explicit_ones_then_class_by_class(fixture):
    assert [(c.name, c.value) for c in fixture.start_constants] == [
        ('SDK_MAKER', 'Makeré'), ('Node_kPlain', 0), ('Node_kGroup', 3), ('Node_kDefault', 3),
        ('Node_kNone', 1)]
    assert fixture.start_constants[0].cpp == 'SDK_MAKER'
    assert [v.name for v in fixture.installs] == ['Node_caching', 'Node_identity', 'Value_kEmpty']


def test_const_statics_are_read_only(fixture):
    by_name = {v.name: v for v in fixture.variables}
    assert not by_name['Node_caching'].readonly
    assert by_name['Node_identity'].readonly
    assert by_name['Node_caching'].cpp == 'Node::caching'
    assert by_name['Node_caching'].descriptor.name == '_p_Value'


def test_constructor_forms(fixture):
    ctors = {c.name: c.constructor for c in fixture.classes}
    node = ctors['Node']
    assert (node.flags, node.takes_self, node.refuse_plain) == (METH_O, True, False)
    # A value class keeps its copy constructor; a class Python derives from does not.
    value = ctors['Value']
    assert (value.flags, value.takes_self) == (METH_VARARGS, False)
    assert [c.prototype for c in value.candidates] == ['Value::Value()', 'Value::Value(Value const &)']
    # An abstract class and a protected constructor refuse the plain object.
    assert ctors['Abstract'].refuse_plain and ctors['Hidden'].refuse_plain


def test_overloaded_constructor_dispatch_and_message(fixture):
    pair = {c.name: c.constructor for c in fixture.classes}['Pair']
    assert pair.flags == METH_VARARGS and pair.max_args == 4
    assert [(r.counts, [c.function for c in r.candidates]) for r in pair.dispatch] == [
        ((2, 2), ['wrap_new_Pair_1']), ((3, 3), ['wrap_new_Pair_2']),
        ((4, 4), ['wrap_new_Pair_3'])]
    assert pair.message == (
        "Wrong number or type of arguments for overloaded function 'new_Pair'.\n"
        '  Possible C/C++ prototypes are:\n'
        '    Pair::Pair(PyObject *,Value &)\n'
        '    Pair::Pair(PyObject *,Value &,Node const &)\n'
        '    Pair::Pair(PyObject *,Node *,Value &,Value &)\n')
    first = pair.candidates[1].args[1]
    assert first.message == "in method 'new_Pair', argument 3 of type 'Node const &'"
    assert first.null_message == 'invalid null reference ' + first.message


def test_overlapping_counts_test_the_first_differing_argument(tmp_path):
    header = '''namespace S {
class A {}; class B {};
class R { public: R(A &a, int **p = 0); R(B &b); virtual ~R(); };
}'''
    text = '''[module]
name = "_M"
proxy = "M"
namespace = "S"
classes = [ { name = "R", family = "f", header = "sdk/Base.h" } ]
'''
    with pytest.raises(model_mod.GeneratorError, match='has no conversion'):
        build(text, header, tmp_path)
    header = header.replace('int **p = 0', 'A *p = 0')
    rules = {c.name: c.constructor for c in build(text, header, tmp_path).classes}['R'].dispatch
    assert [r.counts for r in rules] == [(2, 2), (3, 3)]
    assert [c.function for c in rules[0].candidates] == ['wrap_new_R_1', 'wrap_new_R_2']
    assert rules[0].tests[0].descriptor.name == '_p_A' and rules[0].tests[1] is None


def test_method_table_order_and_flags(fixture):
    rows = [(e.name, e.flags) for e in fixture.entries]
    assert rows[:2] == [('SWIG_PyInstanceMethod_New', METH_O), ('SWIG_PyStaticMethod_New', METH_O)]
    # Members sit between destruction and the hand-over to the host.
    assert rows[2:17] == [('new_Node', METH_O), ('delete_Node', METH_O), ('Node_count', METH_O),
                          ('Node_setCount', METH_VARARGS), ('Node_make', METH_VARARGS),
                          ('Node_parent', METH_O), ('Node_value', METH_O),
                          ('Node_rename', METH_VARARGS), ('Node_names', METH_VARARGS),
                          ('Node_pick', METH_VARARGS),
                          # A writable static variable has its own getter and setter; a
                          # read-only one (identity) is reached through cvar only.
                          ('Node_caching_get', METH_VARARGS), ('Node_caching_set', METH_O),
                          ('disown_Node', METH_O), ('Node_swigregister', METH_O),
                          ('Node_swiginit', METH_VARARGS)]
    # No director: no disown entry.
    value = rows.index(('new_Value', METH_VARARGS))
    assert rows[value:value + 4] == [('new_Value', METH_VARARGS), ('delete_Value', METH_O),
                                     ('Value_swigregister', METH_O),
                                     ('Value_swiginit', METH_VARARGS)]
    # Each public data member: a setter taking the value and a getter.
    assert rows[-8:-2] == [('Pod_count_set', METH_VARARGS), ('Pod_count_get', METH_O),
                           ('Pod_value_set', METH_VARARGS), ('Pod_value_get', METH_O),
                           ('Pod_owner_set', METH_VARARGS), ('Pod_owner_get', METH_O)]


def test_data_members_lend_class_values_and_hand_over_directors(fixture):
    pod = {c.name: c for c in fixture.classes}['Pod']
    by_entry = {m.entry: m.candidates[0] for m in pod.members}
    assert by_entry['Pod_value_get'].result.kind == 'reference'
    assert by_entry['Pod_count_get'].result.kind == 'scalar'
    value = by_entry['Pod_value_set'].args[1]
    assert (value.reference, value.disown) == (True, False)
    assert value.message == "in method 'Pod_value_set', argument 2 of type 'Value'"
    owner = by_entry['Pod_owner_set'].args[1]
    # The host deletes a node its owner points to: the setter takes it over.
    assert (owner.reference, owner.disown) == (False, True)


def test_director_function_count(fixture):
    # Constructors, destructor, forwarding overrides and protected companions.
    counts = {d.cls: (len(d.constructors), len(d.forwards), len(d.companions), d.function_count)
              for d in fixture.directors}
    assert counts['Pair'] == (3, 0, 0, 4)
    assert counts['Abstract'] == (1, 1, 0, 3)


def test_python_bases_come_from_the_module_or_an_import(fixture):
    bases = {c.name: c.python_base for c in fixture.classes}
    assert bases['Mesh'] == 'Shape' and bases['Node'] is None


def test_signature_block(fixture):
    sig = fixture.signature()
    assert len(sig) == 128
    assert sig[:8] == b'HLVNPSIG'
    assert int.from_bytes(sig[8:12], 'little') == 20990100
    assert int.from_bytes(sig[12:16], 'little') == len(fixture.entries)
    assert sig[32:64].rstrip(b'\0') == b'_Fixture'


@pytest.mark.parametrize('t, spelled, mangled', [
    (CType('lvref', inner=CType('record', 'VObject', const=True)), 'VObject const &', '_p_VObject'),
    (CType('pointer', inner=CType('builtin', 'char', const=True)), 'char const *', '_p_char'),
    (CType('enum', 'VSpace::Space'), 'VSpace::Space', None),
    (CType('pointer', inner=CType('record', 'V3dView::ColorTable')), 'V3dView::ColorTable *',
     '_p_V3dView__ColorTable'),
    (CType('pointer', inner=CType('array', size=4, inner=CType('builtin', 'double'))),
     'double (*)[4]', '_p_a_4__double'),
    (CType('pointer', inner=CType('builtin', 'unsigned int', const=True)), 'unsigned int const *',
     '_p_unsigned_int'),
])
def test_spelling_and_mangling(t, spelled, mangled):
    assert spell(t) == spelled
    if mangled:
        assert pointer_descriptor_name(t.inner)[0] == mangled


def members(fixture, cls='Node'):
    return {m.member: m for m in next(c for c in fixture.classes if c.name == cls).members}


def test_member_arguments_and_their_messages(fixture):
    m = members(fixture)
    (count,) = m['count'].candidates
    assert count.args[0].is_self and count.args[0].spelling == 'Node const *'
    assert count.args[0].null_message == ("invalid null reference in method 'Node_count', "
                                          "argument 1 of type 'Node const *'")
    assert count.result.kind == 'scalar' and count.prototype == 'Node::count() const'
    (set_count,) = m['setCount'].candidates
    n, notify = set_count.args[1:]
    assert n.message == "in method 'Node_setCount', argument 2 of type 'unsigned int'"
    assert (notify.converter, notify.default) == ('AsBool', 'true')
    assert (set_count.min_args, set_count.max_args) == (2, 3)
    # A static member: no self, its first argument is argument 1; an
    # enumerator default is qualified so that it compiles outside the class.
    (make,) = m['make'].candidates
    assert make.static and make.args[0].kind == 'chars'
    assert make.args[0].message == "in method 'Node_make', argument 1 of type 'char const *'"
    assert (make.args[1].cast, make.args[1].default) == ('Node::Kind', 'Node::kPlain')
    assert make.result.kind == 'value' and make.result.descriptor.name == '_p_Value'


def test_strings_lists_and_status(fixture):
    m = members(fixture)
    (rename,) = m['rename'].candidates
    name, aliases = rename.args[1:]
    assert (name.kind, name.message) == ('string', 'Expected a String or Unicode object for argument 2')
    assert aliases.kind == 'string_array' and aliases.output
    assert aliases.list_messages == ('Argument 3 must be a list object',
                                     'Unable to modify argument 3 to return results')
    assert rename.result.kind == 'status'
    # The status output is the wrapper's own: it keeps its number but takes no
    # Python argument.
    (names,) = m['names'].candidates
    prefix, status = names.args[1:]
    assert (prefix.kind, prefix.optional, prefix.slot) == ('string_ptr', True, 1)
    assert (status.kind, status.number, status.slot) == ('status_out', 3, None)
    assert (names.min_args, names.max_args) == (1, 2)
    assert names.prototype == 'Node::names(VString const *,VStatus *) const'


def test_member_overloads_test_the_differing_argument(fixture):
    pick = members(fixture)['pick']
    assert pick.flags == METH_VARARGS
    assert [r.counts for r in pick.dispatch] == [(2, 2), (3, 3)]
    assert pick.message.endswith('    Node::pick(int)\n    Node::pick(Value const &,int)\n')
