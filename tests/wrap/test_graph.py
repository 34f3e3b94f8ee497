"""The application's engines driving Python plug-ins: nodes computed through
their directors, dirty values sent downstream, evaluation on several host
threads, and commands, data and scene files written in Python."""
import math

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

PLUGIN = '''
import math
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class SineNode(vpx.VPxNode):
    input = ov.VObject()
    output = ov.VObject()
    spare = ov.VObject()

    def compute(self, plug, block):
        if plug.attribute() != SineNode.output:
            return 'unknown'
        x = block.inputValue(SineNode.input).asDouble()
        if x == 13:
            raise ValueError('unlucky input')
        handle = block.outputValue(SineNode.output)
        handle.setDouble(math.sin(x))
        block.setClean(plug)


def sine_initializer():
    numeric = ov.VFnNumericAttribute()
    SineNode.input = numeric.create('input', 'in', ov.VFnNumericData.kDouble, 0.0)
    numeric.setKeyable(True)
    SineNode.output = numeric.create('output', 'out', ov.VFnNumericData.kDouble, 0.0)
    numeric.setWritable(False)
    numeric.setStorable(False)
    SineNode.spare = numeric.create('spare', 'sp', ov.VFnNumericData.kInt, 7)
    numeric.setWritable(False)
    for attribute in (SineNode.input, SineNode.output, SineNode.spare):
        vpx.VPxNode.addAttribute(attribute)
    vpx.VPxNode.attributeAffects(SineNode.input, SineNode.output)


total = [0]


class Accumulate(vpx.VPxCommand):
    def __init__(self):
        super().__init__()
        self.setUndoable(True)

    def doIt(self, args):
        self.amount = args.asInt(0)
        self.redoIt()

    def redoIt(self):
        total[0] += self.amount
        vpx.VPxCommand.setResult(total[0])

    def undoIt(self):
        total[0] -= self.amount


class Words(vpx.VPxData):
    def __init__(self):
        super().__init__()
        self.words = []

    def typeId(self):
        return ov.VTypeId(0x7A11)

    def name(self):
        return 'words'

    def copy(self, source):
        self.words = [w.upper() for w in source.words]

    def readASCII(self, args, last):
        self.words = [args.asString(i) for i in range(args.length())]

    def writeASCII(self, out):
        ov.VStreamUtils.writeInt(out, len(self.words))
        for word in self.words:
            ov.VStreamUtils.writeCharBuffer(out, ' ' + word)


class Echo(vpx.VPxFileTranslator):
    def haveWriteMethod(self):
        return True

    def writer(self, file, options, mode):
        with open(file.expandedFullName(), 'w') as f:
            f.write('echo %d' % mode)


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'Tests', '1.0')
    plugin.registerNode('pySine', ov.VTypeId(0x7A10), SineNode, sine_initializer)
    plugin.registerCommand('accumulate', Accumulate)
    plugin.registerData('words', ov.VTypeId(0x7A11), Words)
    plugin.registerFileTranslator('echo', None, Echo)
'''


@pytest.fixture
def plugin(tmp_path):
    namespace = {}
    exec(compile(PLUGIN, str(tmp_path / 'graph_plugin.py'), 'exec'), namespace)
    namespace['initializePlugin'](host.load_plugin('graphPlugin', str(tmp_path)))
    host.clear_log()
    yield namespace
    host.command_flush()
    host.graph_clear()
    host.unload_all_plugins()


def computes():
    return {n['name']: n['computes'] for n in host.graph_nodes()}


class TestNodes:
    def test_values_are_computed_through_the_director_on_demand(self, plugin):
        node = host.graph_create('pySine')
        assert host.graph_nodes() == [{'name': 'pySine1', 'type': 'pySine',
                                       'attributes': ['input', 'output', 'spare'],
                                       'computes': 0}]
        host.graph_set(node + '.in', 0.5)
        assert host.graph_get(node + '.output') == math.sin(0.5)
        assert host.graph_get(node + '.out') == math.sin(0.5) and computes() == {node: 1}
        # 'unknown' leaves the host's value, the default, and the plug clean.
        assert host.graph_get(node + '.spare') == 7.0 and computes() == {node: 2}
        assert host.graph_get(node + '.spare') == 7.0 and computes() == {node: 2}

    def test_changes_go_downstream_through_connections(self, plugin):
        a, b, c = (host.graph_create('pySine') for _ in range(3))
        host.graph_connect(a + '.output', b + '.input')
        host.graph_connect(b + '.output', c + '.input')
        host.graph_set(a + '.input', 1.0)
        assert host.graph_get(c + '.output') == math.sin(math.sin(math.sin(1.0)))
        assert computes() == {a: 1, b: 1, c: 1}
        host.graph_set(a + '.input', 2.0)
        assert host.graph_get(b + '.output') == math.sin(math.sin(2.0))
        assert computes() == {a: 2, b: 2, c: 1}
        assert host.graph_get(c + '.output') == math.sin(math.sin(math.sin(2.0)))
        with pytest.raises(RuntimeError) as e:
            host.graph_set(b + '.input', 0.0)
        assert str(e.value) == "The plug 'pySine2.input' takes its value from 'pySine1.output'"

    def test_declarations_belong_to_the_initializer(self, plugin):
        numeric = ov.VFnNumericAttribute()
        attribute = numeric.create('late', 'lt', ov.VFnNumericData.kFloat, 0.25)
        assert (numeric.name(), numeric.shortName(), numeric.defaultValue()) == ('late', 'lt', 0.25)
        with pytest.raises(RuntimeError) as e:
            vpx.VPxNode.addAttribute(attribute)
        assert str(e.value) == ('No node type is being initialized: attributes are declared in '
                                'the initializer of a node type')


class TestEvaluation:
    WIDTH, DEPTH = 16, 4

    def build(self):
        """Chains of nodes, each reading the one above it."""
        rows = []
        for level in range(self.DEPTH):
            row = [host.graph_create('pySine', f'c{i}_{level}') for i in range(self.WIDTH)]
            if rows:
                for above, node in zip(rows[-1], row):
                    host.graph_connect(above + '.output', node + '.input')
            rows.append(row)
        host.graph_evaluate(1)  # computes the spare values, once for all
        return rows

    def values(self, rows):
        return [[host.graph_get(n + '.output') for n in row] for row in rows]

    def expected(self, inputs):
        rows = [[math.sin(x) for x in inputs]]
        for _ in range(self.DEPTH - 1):
            rows.append([math.sin(x) for x in rows[-1]])
        return rows

    def test_eight_threads_compute_what_one_does(self, plugin):
        rows = self.build()
        results = {}
        for threads, shift in ((1, 0.0), (8, 0.5), (1, 0.5), (8, 0.0)):
            inputs = [i * 0.1 + shift for i in range(self.WIDTH)]
            for node, x in zip(rows[0], inputs):
                host.graph_set(node + '.input', x)
            before = sum(computes().values())
            host.graph_evaluate(threads)
            # One compute per node; reading the values computes nothing more.
            assert sum(computes().values()) - before == self.WIDTH * self.DEPTH
            # The threads take the nodes in turn; those that found one computed.
            assert 1 <= len(host.graph_threads()) <= threads
            results[threads, shift] = self.values(rows)
            assert sum(computes().values()) - before == self.WIDTH * self.DEPTH
        assert results[1, 0.0] == results[8, 0.0] == self.expected(
            [i * 0.1 for i in range(self.WIDTH)])
        assert results[8, 0.5] == results[1, 0.5]

    def test_an_exception_in_compute_is_reported_and_evaluation_goes_on(self, plugin):
        rows = self.build()
        inputs = [13.0 if i == 3 else i / 4 for i in range(self.WIDTH)]
        for node, x in zip(rows[0], inputs):
            host.graph_set(node + '.input', x)
        with pytest.raises(RuntimeError) as e:
            host.graph_evaluate(8)
        assert str(e.value) == "Computing 'c3_0.output' failed: ValueError: unlucky input"
        log = host.log_entries()
        assert len(log) == 1 and log[0].startswith(
            "Python exception in plug-in 'graphPlugin', in SineNode.compute, "
            "computing 'c3_0.output':\nTraceback")
        assert ', in compute\n' in log[0] and log[0].endswith('ValueError: unlucky input')
        counts = computes()
        # Past the two computes of build(): the failed one, and none below it.
        assert [counts[f'c3_{level}'] for level in range(self.DEPTH)] == [3, 2, 2, 2]
        assert all(counts[f'c{i}_3'] == 3 for i in range(self.WIDTH) if i != 3)
        assert host.graph_get('c2_3.output') == self.expected(inputs)[3][2]
        # The failed chain stays dirty: reading it computes again, and fails again.
        with pytest.raises(RuntimeError) as e:
            host.graph_get('c3_3.output')
        assert str(e.value) == "Computing 'c3_0.output' failed: ValueError: unlucky input"
        host.graph_set('c3_0.input', 3.0)
        host.graph_evaluate(8)
        assert host.graph_get('c3_3.output') == self.expected([3.0])[3][0]


class TestEngines:
    def test_commands_are_kept_for_undo_and_redo(self, plugin):
        total = plugin['total']
        assert host.command_run('accumulate', 5) == '5'
        assert host.command_run('accumulate', 2) == '7'
        host.command_undo()
        host.command_undo()
        assert total == [0]
        with pytest.raises(RuntimeError) as e:
            host.command_undo()
        assert str(e.value) == 'There is nothing to undo'
        host.command_redo()
        assert total == [5] and host.alive('VPxCommand') == 2
        host.command_flush()
        assert host.alive('VPxCommand') == 0

    def test_data_and_files_written_in_python(self, plugin, tmp_path):
        assert host.round_trip_data('words', 'one "two three"') == ('2 one two three',
                                                                     '2 ONE TWO THREE')
        assert host.alive('VPxData') == 0
        path = str(tmp_path / 'scene.echo')
        host.export_scene(path, 'echo')
        assert open(path).read() == f'echo {vpx.VPxFileTranslator.kExportAccessMode}'
        with pytest.raises(RuntimeError) as e:
            host.import_scene(path, 'echo')
        assert str(e.value) == "The file translator 'echo' does not read files"
