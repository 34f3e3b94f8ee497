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
    assert names == ['_p_Abstract', '_p_Helper', '_p_Hidden', '_p_Mesh', '_p_Node', '_p_Pair',
                     '_p_Root', '_p_Shape', '_p_Value', '_p_int', '_p_intPtr']
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
    with pytest.raises(model_mod.GeneratorError, match='_p_Node is derived from the headers'):
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
    value = ctors['Value']
    assert (value.flags, value.takes_self) == (METH_NOARGS, False)
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
class R { public: R(A &a, int *p = 0); R(B &b); virtual ~R(); };
}'''
    text = '''[module]
name = "_M"
proxy = "M"
namespace = "S"
classes = [ { name = "R", family = "f", header = "sdk/Base.h" } ]
'''
    with pytest.raises(model_mod.GeneratorError, match='has no conversion yet'):
        build(text, header, tmp_path)
    header = header.replace('int *p = 0', 'A *p = 0')
    rules = {c.name: c.constructor for c in build(text, header, tmp_path).classes}['R'].dispatch
    assert [r.counts for r in rules] == [(2, 2), (3, 3)]
    assert [c.function for c in rules[0].candidates] == ['wrap_new_R_1', 'wrap_new_R_2']
    assert rules[0].tests[0].descriptor.name == '_p_A' and rules[0].tests[1] is None


def test_method_table_order_and_flags(fixture):
    rows = [(e.name, e.flags) for e in fixture.entries]
    assert rows[:2] == [('SWIG_PyInstanceMethod_New', METH_O), ('SWIG_PyStaticMethod_New', METH_O)]
    assert rows[2:7] == [('new_Node', METH_O), ('delete_Node', METH_O), ('disown_Node', METH_O),
                         ('Node_swigregister', METH_O), ('Node_swiginit', METH_VARARGS)]
    # No director: no disown entry.
    assert rows[-4:] == [('new_Value', METH_NOARGS), ('delete_Value', METH_O),
                         ('Value_swigregister', METH_O), ('Value_swiginit', METH_VARARGS)]


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
