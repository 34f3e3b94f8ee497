"""The module as the interpreter and the host see it after import: method
table, constants, exported data, the two head entries and the shared table."""
import ctypes
import os
import subprocess

import pytest

import vorlatesthost as host
from openvorla import OpenVorla, OpenVorlaVPx, _OpenVorla, _OpenVorlaVPx as ext

HERE = os.path.dirname(__file__)
METH_VARARGS, METH_NOARGS, METH_O = 1, 4, 8

# Catalogue order; the classes without a director.
CLASSES = """VFnPlugin VPxNode VPxCommand VPxAttributePatternFactory VPxBakeEngine VPxSurfaceShape
VPxComponentShape VPxData VPxCameraSet VPxEditData VExternalContentInfoTable
VExternalContentLocationTable VPxFileResolver VPxFileTranslator VPxGeometryData
VPxGeometryIterator VPxImageFile VPxImagePlane VPxVorlaAsciiFilterOutput VPxVorlaAsciiFilter
VPxObjectSet VPxAssembly VPxRepresentation VPxPolyTrg VPxTransformationMatrix VPxTransform
VPxPolyTweakUVCommand VPxMultiPolyTweakUVCommand MaterialInputData VPxMaterialInformation
VPxCacheFormat VPxCacheConfigRuleFilter VPxGeometryFilter VPxDeformerNode VPxSkinCluster
VPxBlendShape VPxIkSolverNode VPxAnimCurveInterpolator VPxConstraint VPxConstraintCommand
VPxMotionPathNode VPx3dModelView VPxContext VPxContextCommand VPxControlCommand
VPxDragAndDropBehavior VPxGlBuffer VPxLocatorNode VPxManipContainer VPxMidiInputDevice
VPxModelEditorCommand VPxSelectionContext VPxSurfaceShapeUI VPxTexContext VPxToolCommand
VPxPolyTweakUVInteractiveCommand VPxUIControl VPxUITableControl VPxHwShaderNode
VPxHardwareShader VPxManipulatorNode VPxEmitterNode VPxFieldNode VPxFluidEmitterNode
VPxSpringNode VPxParticleAttributeMapperNode VPxRenderPassImpl""".split()
NO_DIRECTOR = {'VFnPlugin', 'VExternalContentInfoTable', 'VExternalContentLocationTable',
               'VPxVorlaAsciiFilterOutput', 'MaterialInputData'}
NEW_FLAGS = {'VPxMaterialInformation': METH_VARARGS, 'VFnPlugin': METH_VARARGS,
             'VPxGeometryIterator': METH_VARARGS, 'VPxRepresentation': METH_VARARGS,
             'VPxCacheConfigRuleFilter': METH_VARARGS, 'VPxContext': METH_VARARGS}


class PyMethodDef(ctypes.Structure):
    _fields_ = [('ml_name', ctypes.c_char_p), ('ml_meth', ctypes.c_void_p),
                ('ml_flags', ctypes.c_int), ('ml_doc', ctypes.c_char_p)]


def method_flags(builtin):
    # A built-in function object keeps its method record right after the object header.
    record = ctypes.c_void_p.from_address(id(builtin) + object.__basicsize__).value
    return PyMethodDef.from_address(record).ml_flags


def read_lines(name):
    with open(os.path.join(HERE, name)) as f:
        return [line.split() for line in f if not line.startswith('#')]


def builtins(module):
    return [(k, v) for k, v in vars(module).items()
            if type(v).__name__ == 'builtin_function_or_method']


POINTER_CLASSES = ['charPtr', 'intPtr', 'shortPtr', 'floatPtr', 'doublePtr', 'boolPtr', 'uIntPtr',
                   'uCharPtr']


def test_method_table_entries_in_order_with_their_flags():
    table = [(k, method_flags(v)) for k, v in builtins(ext)]
    assert all(v.__doc__ is None for _, v in builtins(ext))
    assert table[:2] == [('SWIG_PyInstanceMethod_New', METH_O), ('SWIG_PyStaticMethod_New', METH_O)]
    expected = []
    for p in POINTER_CLASSES:
        expected += [(f'new_{p}', METH_VARARGS), (f'delete_{p}', METH_O),
                     (f'{p}_assign', METH_VARARGS), (f'{p}_value', METH_O), (f'{p}_cast', METH_O),
                     (f'{p}_frompointer', METH_O), (f'{p}_swigregister', METH_O),
                     (f'{p}_swiginit', METH_VARARGS)]
    expected.append(('getLockCaptureCount', METH_NOARGS))
    assert table[2:2 + len(expected)] == expected
    rest = table[2 + len(expected):]
    # Per class: construction and destruction, its members, then the hand-over
    # to the host (director classes only) and registration.
    for c in CLASSES:
        flags = NEW_FLAGS.get(c, METH_NOARGS if c in NO_DIRECTOR else METH_O)
        assert rest[:2] == [(f'new_{c}', flags), (f'delete_{c}', METH_O)]
        rest = rest[2:]
        while rest and rest[0][0].startswith(c + '_') and not rest[0][0].endswith('_swigregister'):
            rest = rest[1:]
        tail = ([(f'disown_{c}', METH_O)] if c not in NO_DIRECTOR else []) + [
            (f'{c}_swigregister', METH_O), (f'{c}_swiginit', METH_VARARGS)]
        assert rest[:len(tail)] == tail
        rest = rest[len(tail):]
    assert rest == []
    assert table[-1] == ('VPxRenderPassImpl_swiginit', METH_VARARGS)


def test_dictionary_in_installation_order():
    names = [k for k in vars(ext) if not k.startswith('__')]
    functions = {k for k, _ in builtins(ext)}
    values = [k for k in names if k not in functions]
    constants = [n for n, _ in read_lines('expected_constants.txt')]
    # PLUGIN_COMPANY and VFnPlugin's constants come before the link object,
    # the other classes' constants after it.
    assert values == ['PLUGIN_COMPANY'] + constants[:5] + ['cvar'] + constants[5:]
    assert ext.PLUGIN_COMPANY == 'Halvern'


def test_integer_constants_have_the_interface_values():
    for name, value in read_lines('expected_constants.txt'):
        assert (name, getattr(ext, name)) == (name, int(value))
    assert type(ext.VPxNode_kLast) is int
    # The proxy classes carry them too.
    assert OpenVorlaVPx.VPxNode.kSerialize == OpenVorlaVPx.VPxNode.kSerial == 2
    assert OpenVorlaVPx.VPxFileResolver.kNone == 1


def symbol_sizes(path):
    out = subprocess.run(['readelf', '-sW', path], check=True, capture_output=True, text=True)
    sizes = {}
    for line in out.stdout.splitlines():
        parts = line.split()
        if len(parts) == 8 and parts[7] in ('VApiVersion', 'HLVN_PLUGIN_SIGNATURE', 'PyInit__OpenVorlaVPx'):
            sizes[parts[7]] = (int(parts[2]), parts[4], parts[3])
    return sizes


def test_exported_version_and_signature():
    lib = ctypes.CDLL(ext.__file__)
    version = (ctypes.c_char * 16).in_dll(lib, 'VApiVersion')
    signature = (ctypes.c_ubyte * 128).in_dll(lib, 'HLVN_PLUGIN_SIGNATURE')
    assert bytes(version)[:9] == b'20250200\0'
    assert ctypes.addressof(signature) - ctypes.addressof(version) == 16
    assert ctypes.addressof(version) % 16 == 0
    sizes = symbol_sizes(ext.__file__)
    assert sizes['VApiVersion'] == (16, 'GLOBAL', 'OBJECT')
    assert sizes['HLVN_PLUGIN_SIGNATURE'] == (128, 'GLOBAL', 'OBJECT')
    block = bytes(signature)
    assert block[:8] == b'HLVNPSIG'
    assert int.from_bytes(block[8:12], 'little') == 20250200
    assert int.from_bytes(block[12:16], 'little') == len(builtins(ext))
    assert int.from_bytes(block[16:20], 'little') == 343
    assert int.from_bytes(block[20:24], 'little') == 186
    assert block[32:64].rstrip(b'\0') == b'_OpenVorlaVPx'


def test_only_the_interface_is_exported():
    out = subprocess.run(['readelf', '--dyn-syms', '-W', ext.__file__], check=True,
                         capture_output=True, text=True).stdout
    defined = {line.split()[7] for line in out.splitlines()
               if len(line.split()) == 8 and line.split()[6] != 'UND'
               and line.split()[4] in ('GLOBAL', 'WEAK') and line.split()[3] in ('FUNC', 'OBJECT')}
    assert {'PyInit__OpenVorlaVPx', 'VApiVersion', 'HLVN_PLUGIN_SIGNATURE'} <= defined
    assert not [s for s in defined if 'swig' in s.lower() or s.startswith('_ZN6swigrt')]


def test_instance_and_static_method_wrapping():
    def plain(self):
        return self
    assert ext.SWIG_PyInstanceMethod_New(plain).__func__ is plain
    assert ext.SWIG_PyStaticMethod_New(plain).__func__ is plain
    # A module function becomes a new built-in made from the same-named entry
    # of the second table, bound to the module as before.
    method = ext.SWIG_PyInstanceMethod_New(ext.delete_VPxNode)
    assert method.__func__ is not ext.delete_VPxNode
    assert method.__func__.__name__ == 'delete_VPxNode' and method.__func__.__self__ is ext
    static = ext.SWIG_PyStaticMethod_New(ext.new_VPxNode)
    assert static.__func__.__name__ == 'new_VPxNode' and static.__func__ is not ext.new_VPxNode
    # A built-in of another module is not in the table: wrapped as it is.
    assert ext.SWIG_PyInstanceMethod_New(len).__func__ is len


def type_table(module_type):
    for types in host.modules():
        names = [t[0] for t in types]
        if module_type in names:
            return types
    raise AssertionError(f'no module with {module_type}')


def test_type_table_names_in_byte_order():
    names = [t[0] for t in type_table('_p_VPxNode')]
    assert names == [n for (n,) in read_lines('expected_types.txt')]
    assert names == sorted(names, key=str.encode)


CAST_LISTS = {
    '_p_VPxNode': 25, '_p_VPxCommand': 5, '_p_VPxGeometryFilter': 3, '_p_VPxContext': 2,
    '_p_VFnBase': 112, '_p_VPxUIControl': 1, '_p_VPxToolCommand': 1, '_p_VPxSurfaceShape': 1,
    '_p_VPxFileTranslator': 1, '_p_VPxEmitterNode': 1, '_p_VPxData': 1, '_p_VDrawInfo': 1,
    '_p_VDGModifier': 1, '_p_VArgParser': 1,
    '_p_m_VFnNurbsSurface__q_const__f_p_VStatus__int': 1,
    # From the sibling, which derives its attribute and data function sets
    # from VFnAttribute and VFnData rather than from VFnBase alone.
    '_p_VFnAttribute': 2, '_p_VFnData': 6,
}
SCALARS = ['bool', 'char', 'short', 'int', 'unsigned_char', 'unsigned_int', 'float', 'double',
           'p_float'] + [f'a_{n}__{t}' for n in (2, 3, 4)
                         for t in ('double', 'float', 'int', 'short', 'unsigned_int')]
HELPER = {'unsigned_char': 'uChar', 'unsigned_int': 'uInt'}


def helper_name(t):
    if t.startswith('a_') and t.endswith('unsigned_int'):
        return '_p_' + t.replace('unsigned_int', 'uIntPtr')
    return '_p_' + HELPER.get(t, t) + 'Ptr'


def test_cast_lists():
    full = {name: host.cast_list(name) for name, _, _ in type_table('_p_VPxNode')}
    # Every list holds the type itself.
    assert all(name in sources for name, sources in full.items())
    lists = {name: [s for s in sources if s != name] for name, sources in full.items()}
    derived = {k: v for k, v in lists.items() if v}
    expected = dict(CAST_LISTS)
    expected.update({f'_p_{t}': 1 for t in SCALARS + ['a_2__a_2__float']})
    assert {k: len(v) for k, v in derived.items()} == expected
    assert len(derived) == 42
    assert sorted(lists['_p_VPxGeometryFilter']) == ['_p_VPxBlendShape', '_p_VPxDeformerNode',
                                                     '_p_VPxSkinCluster']
    assert all(s.startswith('_p_VFn') for s in lists['_p_VFnBase'])
    for t in SCALARS:
        assert lists[f'_p_{t}'] == [helper_name(t)]


def test_descriptors_shared_with_the_sibling():
    tables = host.modules()
    assert len(tables) == 2
    vpx, sibling = ({name: addr for name, _, addr in t} for t in
                    sorted(tables, key=lambda t: -len(t)))
    common = set(vpx) & set(sibling)
    assert common >= {'_p_VObject', '_p_VTypeId', '_p_VFnBase'}
    assert all(vpx[n] == sibling[n] for n in common)


def test_sibling_objects_are_accepted():
    obj = OpenVorla.VObject()
    # Arguments convert before the abstract class refuses the plain object.
    with pytest.raises(RuntimeError, match='^accessing abstract class or protected constructor$'):
        ext.new_VPxMaterialInformation(None, obj)
    with pytest.raises(TypeError) as e:
        ext.new_VPxMaterialInformation(None, 1)
    assert str(e.value) == ("in method 'new_VPxMaterialInformation', argument 2 of type 'VObject &'"
                            "\nAdditional information:\n"
                            "Wrong number or type of arguments for overloaded function "
                            "'new_VPxMaterialInformation'.\n  Possible C/C++ prototypes are:\n"
                            "    VPxMaterialInformation::VPxMaterialInformation(PyObject *,VObject &)\n"
                            "    VPxMaterialInformation::VPxMaterialInformation(PyObject *,VObject &,"
                            "VObject const &)\n")
    assert isinstance(OpenVorlaVPx.VFnPlugin(), OpenVorla.VFnBase)
    assert _OpenVorla.new_VTypeId(7) is not None
