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
        print(vorla.alive('VPxFileTranslator') - before[1][3])
        ''')
    assert scene.read_text().splitlines()[:5] == [
        'vorla-text 1', 'node sineNode wave', 'set wave.input 0.25', 'set wave.amplitude -2.0',
        'set wave.output -0.4948079185090459']
    assert lines[:2] == ["[('wave', 'sineNode', 0)]", 'True']
    assert lines[3:] == ["ValueError: line 6: cannot read 'frobnicate'", '0']
