"""The example plug-ins as a user runs them: each loads, works, and unloads
with none of its Python instances or host objects left alive."""
import textwrap

from app_runner import example

# Counts what lives before and after: the plug-in classes' Python instances
# and the host's objects of their base classes.
COUNTING = '''
import gc
import vorla
from openvorla import OpenVorlaVPx as vpx

BASES = ('VPxNode', 'VPxCommand', 'VPxData', 'VPxFileTranslator')


def alive():
    gc.collect()
    python = sum(isinstance(o, tuple(getattr(vpx, b) for b in BASES)) for o in gc.get_objects())
    return python, [vorla.alive(b) for b in BASES]


before = alive()
'''

UNLOADED = '''
for name in vorla.plugins():
    vorla.unload_plugin(name)
print('left', vorla.plugins(), vorla.registered(), vorla.nodes(), alive() == before)
'''


def run(vorla, plugins, script):
    args = [a for p in plugins for a in ('--plugin', example(p))]
    lines = vorla.ok(*args, script=COUNTING + textwrap.dedent(script) + UNLOADED)
    assert lines[-1] == 'left [] [] [] True'
    return lines[:-1]


def test_sine_node_computes_on_demand_and_through_connections(vorla):
    lines = run(vorla, ['sine_node.py'], '''
        import math
        a = vorla.create_node('sineNode')
        b = vorla.create_node('sineNode', 'b')
        vorla.set_attr('sineNode1.input', 0.5)
        vorla.set_attr('sineNode1.amplitude', 3)
        print(a, b, vorla.get_attr('sineNode1.output') == 3 * math.sin(0.5))
        vorla.get_attr('sineNode1.output')
        vorla.connect('sineNode1.output', 'b.input')
        print(vorla.get_attr('b.output') == math.sin(3 * math.sin(0.5)))
        vorla.set_attr('sineNode1.input', 0)
        print(vorla.get_attr('b.output'), vorla.nodes())
        try:
            vorla.set_attr('b.output', 1)
        except RuntimeError as e:
            print(e)
        vorla.delete_node('sineNode1')
        print(vorla.nodes(), vorla.alive('VPxNode') - before[1][0])
        ''')
    assert lines == ["sineNode1 b True", 'True',
                     "0.0 [('sineNode1', 'sineNode', 2), ('b', 'sineNode', 2)]",
                     "The plug 'b.output' is not writable",
                     "[('b', 'sineNode', 2)] 1"]


def test_offset_command_with_its_arguments_undo_and_redo(vorla):
    lines = run(vorla, ['sine_node.py', 'offset_command.py'], '''
        vorla.create_node('sineNode', 's')
        vorla.set_attr('s.input', 1)
        print(vorla.run_command('offsetAttr', 's.input', 0.5))
        print(vorla.run_command('offsetAttr', 's.input', 0.25, '-times', 4))
        print(vorla.alive('VPxCommand') - before[1][1])   # both kept for undo
        vorla.undo()
        print(vorla.get_attr('s.input'))
        vorla.undo()
        print(vorla.get_attr('s.input'))
        vorla.redo()
        print(vorla.get_attr('s.input'))
        for args in [('s.nothing', 1), ('s.output', 1)]:
            try:
                vorla.run_command('offsetAttr', *args)
            except RuntimeError as e:
                print(e)
        print(vorla.log()[-1].splitlines()[-1])
        vorla.unload_plugin('offset_command')   # takes its kept commands along
        print(vorla.alive('VPxCommand') - before[1][1])
        try:
            vorla.undo()
        except RuntimeError as e:
            print(e)
        ''')
    assert lines == ['1.5', '2.5', '2', '1.5', '1.0', '1.5',
                     "The command 'offsetAttr' failed: "
                     "RuntimeError: The node 's' has no attribute 'nothing'",
                     "The command 'offsetAttr' failed: "
                     "RuntimeError: The plug 's.output' is not writable",
                     "RuntimeError: The plug 's.output' is not writable",
                     '0', 'There is nothing to undo']


def test_vector_data_reads_copies_and_writes_itself(vorla):
    lines = run(vorla, ['vector_data.py'], '''
        print(vorla.round_trip_data('vectorData', '1 2.5 -3'))
        print(vorla.round_trip_data('vectorData', '0.1 1e-300 "7"'))
        try:
            vorla.round_trip_data('vectorData', '1 2')
        except RuntimeError as e:
            print(e)
        print(vorla.log()[-1].splitlines()[-1])
        print(vorla.alive('VPxData') - before[1][2])
        ''')
    assert lines == ["('1 2.5 -3', '1 2.5 -3')", "('0.1 1e-300 7', '0.1 1e-300 7')",
                     "Reading the data type 'vectorData' from ASCII failed: "
                     "ValueError: vectorData needs three numbers, got 2",
                     'ValueError: vectorData needs three numbers, got 2', '0']


def test_text_translator_writes_the_scene_and_reads_it_back(vorla, tmp_path):
    scene = tmp_path / 'scene.vtx'
    lines = run(vorla, ['sine_node.py', 'text_translator.py'], f'''
        vorla.create_node('sineNode', 'wave')
        vorla.set_attr('wave.input', 0.25)
        vorla.set_attr('wave.amplitude', -2)
        values = {{p: vorla.get_attr(p) for p in ['wave.input', 'wave.amplitude', 'wave.output']}}
        vorla.export_scene({str(scene)!r}, 'vorlaText')
        vorla.delete_node('wave')
        vorla.import_scene({str(scene)!r}, 'vorlaText')
        print(vorla.nodes())
        print(values == {{p: vorla.get_attr(p) for p in values}})
        vorla.delete_node('wave')
        with open({str(scene)!r}, 'a') as f:
            f.write('frobnicate\\n')
        try:
            vorla.import_scene({str(scene)!r}, 'vorlaText')
        except RuntimeError as e:
            print(e)
        print(vorla.log()[-1].splitlines()[-1])
        for name, _, _ in vorla.nodes():
            vorla.delete_node(name)
        vorla.create_node('sineNode', 'wave')
        vorla.set_attr('wave.input', 0.5)
        for options in ({{'precision': 3}}, 'precision=5;comment=x', None, 7):
            try:
                vorla.export_scene({str(scene)!r} + '2', 'vorlaText', options)
                print(open({str(scene)!r} + '2').read().splitlines()[4])
            except TypeError as e:
                print(e)
        for name, _, _ in vorla.nodes():
            vorla.delete_node(name)
        print(vorla.alive('VPxFileTranslator') - before[1][3])
        ''')
    assert scene.read_text().splitlines()[:5] == [
        'vorla-text 1', 'node sineNode wave', 'set wave.input 0.25', 'set wave.amplitude -2.0',
        'set wave.output -0.4948079185090459']
    assert lines[:2] == ["[('wave', 'sineNode', 0)]", 'True']
    assert lines[3:] == ["ValueError: line 6: cannot read 'frobnicate'",
                         # The options passed replace the registered precision=17.
                         'set wave.output 0.479', 'set wave.output 0.47943',
                         'set wave.output 0.479425538604203',
                         "export_scene() takes options as a str or a dict, not 'int'", '0']


def test_wave_deformer_moves_points_with_numpy_on_host_threads(vorla):
    lines = run(vorla, ['wave_deformer.py'], '''
        nodes = [vorla.create_node('waveDeformer') for _ in range(8)]
        for i, node in enumerate(nodes):
            vorla.set_attr(node + '.inputGeom', [[x / 4, i, 0] for x in range(5)])
            vorla.set_attr(node + '.amplitude', 0.5)
        vorla.evaluate(threads=4)
        print([[round(y, 6) for _, y, _ in vorla.get_attr(n + '.outputGeom')] for n in nodes[:2]])
        vorla.set_attr(nodes[0] + '.envelope', 0.5)
        vorla.set_attr(nodes[0] + '.wavelength', 2.0)
        print([round(y, 6) for _, y, _ in vorla.get_attr(nodes[0] + '.outputGeom')])
        ''')
    assert lines[:2] == ['[[0.0, 0.5, 0.0, -0.5, -0.0], [1.0, 1.5, 1.0, 0.5, 1.0]]',
                         '[0.0, 0.176777, 0.25, 0.176777, 0.0]']


def test_marker_locator_and_snap_transform_give_the_host_their_box_and_matrix(vorla):
    lines = run(vorla, ['marker_locator.py', 'snap_transform.py'], '''
        marker = vorla.create_node('marker')
        print(vorla.attributes(marker))
        print(vorla.get_attr(marker + '.nodeBoundingBoxMin'),
              vorla.get_attr(marker + '.nodeBoundingBoxMax'))
        vorla.set_attr(marker + '.localPosition', [1, 0, 2])
        vorla.set_attr(marker + '.localScale', [2, 2, 2])
        print(vorla.get_attr(marker + '.nodeBoundingBoxMin'),
              vorla.get_attr(marker + '.nodeBoundingBoxMax'))
        snap = vorla.create_node('snapTransform')
        vorla.set_attr(snap + '.translate', [1.2, 0.3, -0.8])
        vorla.set_attr(snap + '.scale', [3, 3, 3])
        print(vorla.get_attr(snap + '.matrix'))
        ''')
    assert lines[:4] == [
        "['localPosition', 'localScale', 'nodeBoundingBoxMin', 'nodeBoundingBoxMax']",
        '[-0.75, 0.0, -0.25] [0.75, 2.0, 0.25]',
        '[-0.5, 0.0, 1.5] [2.5, 4.0, 2.5]',
        '[[3.0, 0.0, 0.0, 0.0], [0.0, 3.0, 0.0, 0.0], [0.0, 0.0, 3.0, 0.0], [1.0, 0.5, -1.0, 1.0]]']


def test_scatter_command_with_flags_undo_and_misuse(vorla):
    lines = run(vorla, ['sine_node.py', 'scatter_command.py'], '''
        made = vorla.run_command('scatter', 'sineNode', '-count', 3, '-seed', 7,
                                 '-attribute', 'input', '-range', 2, 4, '-p', 'dot')
        print(made, all(2 <= vorla.get_attr(n + '.input') <= 4 for n in made))
        vorla.undo()
        print(vorla.nodes())
        vorla.redo()
        print([n for n, _, _ in vorla.nodes()])
        for args in [('sineNode', '-count', -2), ('sineNode', '-range', 0), ('sineNode', '-x')]:
            try:
                vorla.run_command('scatter', *args)
            except RuntimeError as e:
                print(e)
        vorla.undo()
        ''')
    assert lines[:6] == [
        "['dot1', 'dot2', 'dot3'] True", '[]', "['dot1', 'dot2', 'dot3']",
        "The flag '-count' of the command 'scatter' takes an integer of 0 or more, not -2",
        "The flag '-range' of the command 'scatter' takes 2 arguments, not 1",
        "The command 'scatter' has no flag '-x'"]


def test_point_cloud_places_and_measures_points_as_python_values(vorla):
    lines = run(vorla, ['point_cloud.py'], '''
        node = vorla.create_node('pointCloud')
        print(vorla.get_attr(node + '.placed'), vorla.get_attr(node + '.centroid'))
        vorla.set_attr(node + '.points', [[0, 0, 0], [2, 0, 0], [1, 3, 0]])
        vorla.set_attr(node + '.placement', [[2, 0, 0, 0], [0, 2, 0, 0], [0, 0, 2, 0], [5, 0, 0, 1]])
        print(vorla.get_attr(node + '.placed'))
        print(vorla.get_attr(node + '.centroid'), vorla.get_attr(node + '.radius'))
        others = [vorla.create_node('pointCloud') for _ in range(6)]
        for i, other in enumerate(others):
            vorla.set_attr(other + '.points', [[x, i, 0] for x in range(i + 1)])
        vorla.evaluate(threads=3)
        print([vorla.get_attr(o + '.centroid') for o in others[:3]], vorla.log())
        ''')
    assert lines == ['[] [0.0, 0.0, 0.0]',
                     '[[5.0, 0.0, 0.0], [9.0, 0.0, 0.0], [7.0, 6.0, 0.0]]',
                     '[7.0, 2.0, 0.0] 4.0',
                     '[[0.0, 0.0, 0.0], [0.5, 1.0, 0.0], [1.0, 2.0, 0.0]] []']
