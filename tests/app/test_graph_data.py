"""Plug-ins as a user writes them for the application: ordinary modules that
use numpy and their own helper modules, attributes that hold points, vectors,
matrices and arrays, deformers that the host asks to deform, and transforms
whose matrix the host composes through their transformation matrix."""

NUMPY_PLUGIN = '''
import numpy as np
import helper
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

SCALE = np.arange(4).mean()          # numpy at import

class Smooth(vpx.VPxNode):
    values = mean = None
    def compute(self, plug, data):
        if plug.attribute() != Smooth.mean:
            return 'unknown'
        count = ov.VFnDoubleArrayData(data.inputValue(Smooth.values).data()).length()
        out = data.outputValue(Smooth.mean)
        out.setDouble(helper.twice(float(np.arange(count + 1).mean())) * SCALE)
        out.setClean()

def initialize():
    typed = ov.VFnTypedAttribute()
    Smooth.values = typed.create('values', 'v', ov.VFnData.kDoubleArray)
    Smooth.mean = ov.VFnNumericAttribute().create('mean', 'm', ov.VFnNumericData.kDouble)
    vpx.VPxNode.addAttribute(Smooth.values)
    vpx.VPxNode.addAttribute(Smooth.mean)
    vpx.VPxNode.attributeAffects(Smooth.values, Smooth.mean)

def initializePlugin(obj):
    assert np.zeros(3).sum() == 0
    vpx.VFnPlugin(obj).registerNode('smooth', ov.VTypeId(0x7A980), Smooth, initialize)

def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(ov.VTypeId(0x7A980))
'''


def test_a_plugin_uses_numpy_and_its_own_modules_on_host_threads(vorla):
    vorla.file('plugins/helper.py', 'def twice(x):\n    return 2 * x\n')
    lines = vorla.ok('--plugin', vorla.file('plugins/smooth.py', NUMPY_PLUGIN), script='''
        import sys, vorla
        names = [vorla.create_node('smooth') for _ in range(20)]
        for i, name in enumerate(names):
            vorla.set_attr(name + '.values', [0.5] * i)
        vorla.evaluate(threads=4)
        print([vorla.get_attr(name + '.mean') for name in names[:3]])
        folder = [p for p in sys.path if p.endswith('plugins')]
        vorla.unload_plugin('smooth')
        print(folder == [sys.modules['helper'].__file__.rsplit('/', 2)[0] + '/plugins'],
              any(p.endswith('plugins') for p in sys.path))
    ''')
    # mean(0..i) * 2 * mean(0..3) = i * 1.5
    assert lines == ['[0.0, 1.5, 3.0]', 'True False']


TYPED_PLUGIN = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

class Kinds(vpx.VPxNode):
    def compute(self, plug, data):
        return 'unknown'

def initialize():
    typed, numeric = ov.VFnTypedAttribute(), ov.VFnNumericAttribute()
    for attribute in (typed.create('points', 'p', ov.VFnData.kPointArray),
                      typed.create('vectors', 'v', ov.VFnData.kVectorArray),
                      typed.create('numbers', 'n', ov.VFnData.kDoubleArray),
                      typed.create('ids', 'i', ov.VFnData.kIntArray),
                      typed.create('xform', 'x', ov.VFnData.kMatrix),
                      numeric.createPoint('position', 'pos'),
                      numeric.create('uv', 'uv', ov.VFnNumericData.k2Double, 0.5)):
        vpx.VPxNode.addAttribute(attribute)

def initializePlugin(obj):
    vpx.VFnPlugin(obj).registerNode('kinds', ov.VTypeId(0x7A981), Kinds, initialize)

def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(ov.VTypeId(0x7A981))
'''


def test_points_vectors_matrices_and_arrays_round_trip_and_misuse_is_named(vorla):
    lines = vorla.ok('--plugin', vorla.file('kinds.py', TYPED_PLUGIN), script='''
        import vorla
        n = vorla.create_node('kinds')
        print([vorla.get_attr(n + '.' + a) for a in ('points', 'ids', 'position', 'uv')])
        print(vorla.get_attr(n + '.xform')[3])
        for attribute, value in (('points', [[1, 2, 3], (4, 5, 6)]), ('vectors', [[0, 0, 1]]),
                                 ('numbers', [0.5, 1.5]), ('ids', [3, 1, 2]),
                                 ('xform', [[2, 0, 0, 0], [0, 2, 0, 0], [0, 0, 2, 0], [1, 2, 3, 1]]),
                                 ('position', [7, 8, 9]), ('uv', (0.25, 0.75))):
            vorla.set_attr(n + '.' + attribute, value)
            print(attribute, vorla.get_attr(n + '.' + attribute))
        for attribute, value in (('position', [1, 2]), ('ids', [1.5]), ('points', [[1, 2]]),
                                 ('xform', [1, 2, 3]), ('numbers', 'x'), ('uv', 1.0)):
            try:
                vorla.set_attr(n + '.' + attribute, value)
            except RuntimeError as e:
                print(e)
        try:
            vorla.set_attr(n + '.numbers', [1, [2]])
        except TypeError as e:
            print(e)
    ''')
    assert lines == [
        '[[], [], [0.0, 0.0, 0.0], [0.5, 0.5]]',
        '[0.0, 0.0, 0.0, 1.0]',
        'points [[1.0, 2.0, 3.0], [4.0, 5.0, 6.0]]',
        'vectors [[0.0, 0.0, 1.0]]',
        'numbers [0.5, 1.5]',
        'ids [3, 1, 2]',
        'xform [[2.0, 0.0, 0.0, 0.0], [0.0, 2.0, 0.0, 0.0], [0.0, 0.0, 2.0, 0.0], '
        '[1.0, 2.0, 3.0, 1.0]]',
        'position [7.0, 8.0, 9.0]',
        'uv [0.25, 0.75]',
        "The plug 'kinds1.position' holds 3 numbers, not a list of 2 numbers",
        "The plug 'kinds1.ids' holds an array of integers, not a list of 1 numbers",
        "The plug 'kinds1.points' holds an array of points (lists of 3 numbers), not lists of 2 "
        'numbers',
        "The plug 'kinds1.xform' holds a matrix (4 rows of 4 numbers), not a list of 3 numbers",
        "The plug 'kinds1.numbers' holds an array of numbers, not a string",
        "The plug 'kinds1.uv' holds 2 numbers, not a number",
        "set_attr() takes a number, a string, or a list of numbers or of lists of numbers, "
        "not 'list'"]


DEFORMERS = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

class Lift(vpx.VPxDeformerNode):
    height = None
    calls = []
    def deform(self, block, iterator, matrix, index):
        Lift.calls.append(iterator.count())
        envelope = block.inputValue(vpx.VPxGeometryFilter.envelope).asDouble()
        height = block.inputValue(Lift.height).asDouble()
        while not iterator.isDone():
            p = iterator.position()
            iterator.setPosition(ov.VPoint(p.x, p.y + envelope * height, p.z))
            iterator.next()

class Matrix(vpx.VPxTransformationMatrix):
    moves = []
    def translateTo(self, vector, space):
        Matrix.moves.append((vector.x, vector.y, vector.z))
        return vpx.VPxTransformationMatrix.translateTo(self, vector, space)

class Spin(vpx.VPxTransform):
    def createTransformationMatrix(self):
        return Matrix()

def initialize():
    Lift.height = ov.VFnNumericAttribute().create('height', 'h', ov.VFnNumericData.kDouble, 1.0)
    vpx.VPxNode.addAttribute(Lift.height)
    vpx.VPxNode.attributeAffects(Lift.height, vpx.VPxGeometryFilter.outputGeom)

def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.registerNode('lift', ov.VTypeId(0x7A982), Lift, initialize, vpx.VPxNode.kDeformerNode)
    plugin.registerTransform('spin', ov.VTypeId(0x7A983), Spin, lambda: None, Matrix,
                             ov.VTypeId(0x7A984))

def uninitializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.deregisterNode(ov.VTypeId(0x7A982))
    plugin.deregisterNode(ov.VTypeId(0x7A983))
'''


def test_the_host_asks_deformers_to_deform_and_transforms_for_their_matrix(vorla):
    lines = vorla.ok('--plugin', vorla.file('deformers.py', DEFORMERS), script='''
        import sys, vorla
        lift = vorla.create_node('lift')
        print(vorla.attributes(lift))
        vorla.set_attr(lift + '.inputGeom', [[0, 0, 0], [1, 2, 3]])
        vorla.set_attr(lift + '.height', 2.0)
        print(vorla.get_attr(lift + '.outputGeom'))
        vorla.set_attr(lift + '.envelope', 0.5)
        print(vorla.get_attr(lift + '.outputGeom'), sys.modules['deformers'].Lift.calls)
        spin = vorla.create_node('spin')
        print(vorla.attributes(spin))
        vorla.set_attr(spin + '.translate', [1, 2, 3])
        vorla.set_attr(spin + '.scale', [2, 2, 2])
        print(vorla.get_attr(spin + '.matrix')[3], sys.modules['deformers'].Matrix.moves)
    ''')
    assert lines == [
        "['inputGeom', 'envelope', 'outputGeom', 'height']",
        '[[0.0, 2.0, 0.0], [1.0, 4.0, 3.0]]',
        '[[0.0, 1.0, 0.0], [1.0, 3.0, 3.0]] [2, 2]',
        "['translate', 'rotate', 'scale', 'matrix']",
        # Composed by the transform's own matrix, a Python subclass here.
        '[1.0, 2.0, 3.0, 1.0] [(1.0, 2.0, 3.0)]']


VALUES_PLUGIN = '''
import numpy as np
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

MIRROR = ov.VMatrix(np.diag([-1.0, 1.0, 1.0, 1.0]))


class Mirror(vpx.VPxNode):
    source = image = ov.VObject()

    def compute(self, plug, data):
        if plug.attribute() != Mirror.image:
            return 'unknown'
        point = ov.VPoint(data.inputValue(Mirror.source).asVector())
        data.outputValue(Mirror.image).setMVector(list(point * MIRROR)[:3])
        data.setClean(plug)


def initialize():
    numeric = ov.VFnNumericAttribute()
    Mirror.source = numeric.createPoint('source', 's')
    Mirror.image = numeric.createPoint('image', 'i')
    numeric.setWritable(False)
    for attribute in (Mirror.source, Mirror.image):
        vpx.VPxNode.addAttribute(attribute)
    vpx.VPxNode.attributeAffects(Mirror.source, Mirror.image)


def round_trips():
    """Values handed to the host and read back from it."""
    points = np.array([[1.0, 2.0, 3.0], [4.0, 5.0, 6.0]])
    cases = [(ov.VFnDoubleArrayData(), [0.5, 1.5], ov.VDoubleArray),
             (ov.VFnIntArrayData(), np.arange(4), ov.VIntArray),
             (ov.VFnPointArrayData(), points, ov.VPointArray),
             (ov.VFnVectorArrayData(), points.tolist(), ov.VVectorArray)]
    out = []
    for fn, given, cls in cases:
        fn.create(given)
        back = fn.array()
        out.append(type(back) is cls and back == cls(given) and len(back) == len(given))
    matrix = ov.VFnMatrixData()
    matrix.create([[2, 0, 0, 0], [0, 2, 0, 0], [0, 0, 2, 0], [1, 2, 3, 1]])
    out.append(matrix.matrix().get()[3] == [1.0, 2.0, 3.0, 1.0])
    return out


def initializePlugin(obj):
    print(round_trips())
    vpx.VFnPlugin(obj).registerNode('mirror', ov.VTypeId(0x7A985), Mirror, initialize)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(ov.VTypeId(0x7A985))
'''


def test_values_round_trip_through_the_host(vorla):
    lines = vorla.ok('--plugin', vorla.file('mirror.py', VALUES_PLUGIN), script='''
        import vorla
        n = vorla.create_node('mirror')
        vorla.set_attr(n + '.source', [1, 2, 3])
        print(vorla.get_attr(n + '.source'), vorla.get_attr(n + '.image'), vorla.log())
    ''')
    assert lines == ['[True, True, True, True, True]', '[1.0, 2.0, 3.0] [-1.0, 2.0, 3.0] []']
