"""The example plug-ins at work: run by `make demo` as

    vorla --plugin examples/plugins/sine_node.py \\
          --plugin examples/plugins/offset_command.py \\
          --plugin examples/plugins/vector_data.py \\
          --plugin examples/plugins/text_translator.py \\
          --plugin examples/plugins/wave_deformer.py \\
          --plugin examples/plugins/marker_locator.py \\
          --plugin examples/plugins/snap_transform.py \\
          --plugin examples/plugins/scatter_command.py \\
          --plugin examples/plugins/point_cloud.py examples/scenes/demo.py
"""
import math
import os
import tempfile

import vorla


def heading(text):
    print(f'\n== {text} ==')


def show_registrations():
    heading('Plug-ins')
    print('loaded:', ', '.join(vorla.plugins()))
    for kind, name, plugin in vorla.registered():
        print(f'  {kind:<15} {name:<12} from {plugin}')


def show_sine_nodes():
    heading('sineNode: output = amplitude * sin(input)')
    first = vorla.create_node('sineNode')
    vorla.set_attr(first + '.input', 0.5)
    vorla.set_attr(first + '.amplitude', 2.0)
    print(f'{first}: input 0.5, amplitude 2 -> output {vorla.get_attr(first + ".output"):.6f}'
          f'  (2 sin 0.5 = {2 * math.sin(0.5):.6f})')
    vorla.get_attr(first + '.output')
    print(f'read again, clean: {first} computed {vorla.nodes()[0][2]} time')
    second = vorla.create_node('sineNode', 'follower')
    vorla.connect(first + '.output', second + '.input')
    print(f'{second}.input <- {first}.output: {second}.output = '
          f'{vorla.get_attr(second + ".output"):.6f}')
    vorla.set_attr(first + '.input', math.pi / 2)
    print(f'{first}.input = pi/2: {first}.output = {vorla.get_attr(first + ".output"):.6f}, '
          f'{second}.output = {vorla.get_attr(second + ".output"):.6f}')
    for name, type_name, computes in vorla.nodes():
        print(f'  {name} ({type_name}) computed {computes} times')
    return first


def show_command(node):
    heading('offsetAttr: an undoable command')
    plug = node + '.input'
    before = vorla.get_attr(plug)
    result = vorla.run_command('offsetAttr', plug, 0.25)
    print(f'offsetAttr {plug} 0.25 -> {result!r}  (was {before:.6f})')
    result = vorla.run_command('offsetAttr', plug, 0.5, '-times', 2)
    print(f'offsetAttr {plug} 0.5 -times 2 -> {result!r}')
    vorla.undo()
    print(f'undo -> {plug} = {vorla.get_attr(plug):.6f}')
    vorla.undo()
    print(f'undo -> {plug} = {vorla.get_attr(plug):.6f}')
    vorla.redo()
    print(f'redo -> {plug} = {vorla.get_attr(plug):.6f}, '
          f'{node}.output = {vorla.get_attr(node + ".output"):.6f}')


def show_data():
    heading('vectorData: read, copied and written as text')
    for text in ['1 2.5 -3', '0.1 1e-300 42']:
        written, copied = vorla.round_trip_data('vectorData', text)
        print(f'read {text!r} -> written {written!r}, copy written {copied!r}')


def show_translator():
    heading('vorlaText: the scene written and read back')
    before = {(name, attr): vorla.get_attr(f'{name}.{attr}')
              for name, _, _ in vorla.nodes() for attr in vorla.attributes(name)}
    with tempfile.TemporaryDirectory() as folder:
        path = os.path.join(folder, 'scene.vtx')
        vorla.export_scene(path, 'vorlaText')
        with open(path) as scene:
            text = scene.read()
        print(f'{os.path.basename(path)}:')
        print(''.join('  | ' + line + '\n' for line in text.splitlines()), end='')
        for name, _, _ in vorla.nodes():
            vorla.delete_node(name)
        print('deleted every node; nodes now:', vorla.nodes())
        vorla.import_scene(path, 'vorlaText')
    after = {(name, attr): vorla.get_attr(f'{name}.{attr}')
             for name, _, _ in vorla.nodes() for attr in vorla.attributes(name)}
    print(f'imported {len(vorla.nodes())} nodes; every value as before: {after == before}')
    for name, _, _ in vorla.nodes():
        vorla.delete_node(name)


def show_point_cloud():
    heading('pointCloud: points placed by a matrix, measured as Python values')
    node = vorla.create_node('pointCloud')
    vorla.set_attr(node + '.points', [[0, 0, 0], [2, 0, 0], [1, 3, 0]])
    vorla.set_attr(node + '.placement', [[1, 0, 0, 0], [0, 1, 0, 0], [0, 0, 1, 0], [5, 0, 0, 1]])
    print(f'{node}.points [[0, 0, 0], [2, 0, 0], [1, 3, 0]], moved 5 along x:')
    print(f'  placed   {vorla.get_attr(node + ".placed")}')
    print(f'  centroid {vorla.get_attr(node + ".centroid")}, '
          f'radius {vorla.get_attr(node + ".radius"):.6f}')
    vorla.delete_node(node)


def show_threads(count=200, threads=4):
    heading(f'{count} sineNodes evaluated on host threads')
    nodes = [vorla.create_node('sineNode') for _ in range(count)]
    for i, node in enumerate(nodes):
        vorla.set_attr(node + '.input', i * 0.01)

    def values():
        return [vorla.get_attr(node + '.output') for node in nodes]

    vorla.evaluate(threads=1)
    serial = values()
    print(f'evaluate(threads=1): computed on host thread {vorla.evaluation_threads()}')
    for node in nodes:
        vorla.set_attr(node + '.amplitude', 1.0)  # dirty again, same values
    vorla.evaluate(threads=threads)
    print(f'evaluate(threads={threads}): computed on host threads {vorla.evaluation_threads()}')
    print(f'the {count} values match the 1-thread run: {values() == serial}')
    print(f'{nodes[-1]}: input {(count - 1) * 0.01:.2f} -> output {serial[-1]:.6f}'
          f'  (math.sin: {math.sin((count - 1) * 0.01):.6f})')
    ours = set(nodes)
    computes = sum(c for name, _, c in vorla.nodes() if name in ours)
    print(f'compute calls: {computes} ({count} nodes, evaluated twice)')


def show_deformer():
    heading('waveDeformer: points moved along a sine wave, with numpy')
    node = vorla.create_node('waveDeformer')
    vorla.set_attr(node + '.inputGeom', [[x / 4, 0, 0] for x in range(5)])
    vorla.set_attr(node + '.amplitude', 0.5)
    print(f'{node}.outputGeom y: {[round(y, 3) + 0.0 for _, y, _ in vorla.get_attr(node + ".outputGeom")]}')
    vorla.set_attr(node + '.envelope', 0.5)
    print(f'envelope 0.5:          {[round(y, 3) + 0.0 for _, y, _ in vorla.get_attr(node + ".outputGeom")]}')
    vorla.delete_node(node)


def show_locator_and_transform():
    heading('marker and snapTransform: the host asks for their box and matrix')
    marker = vorla.create_node('marker')
    vorla.set_attr(marker + '.localPosition', [1, 0, 2])
    vorla.set_attr(marker + '.localScale', [2, 2, 2])
    print(f'{marker} at [1, 0, 2], scale 2: box {vorla.get_attr(marker + ".nodeBoundingBoxMin")}'
          f' .. {vorla.get_attr(marker + ".nodeBoundingBoxMax")}')
    snap = vorla.create_node('snapTransform')
    vorla.set_attr(snap + '.translate', [1.2, 0.3, -0.8])
    print(f'{snap}.translate = [1.2, 0.3, -0.8]: matrix translation '
          f'{vorla.get_attr(snap + ".matrix")[3][:3]}  (snapped to half units)')
    vorla.delete_node(marker)
    vorla.delete_node(snap)


def show_scatter():
    heading('scatter: a command with flags, checked by the host')
    made = vorla.run_command('scatter', 'sineNode', '-count', 4, '-seed', 1,
                             '-attribute', 'input', '-range', 0, 3.14, '-prefix', 'dot')
    print(f'scatter sineNode -count 4 -seed 1 -attribute input -range 0 3.14 -prefix dot'
          f'\n  -> {made}')
    print('  inputs:', [round(vorla.get_attr(n + '.input'), 3) for n in made])
    vorla.undo()
    print('undo ->', [n for n, _, _ in vorla.nodes() if n.startswith('dot')])
    try:
        vorla.run_command('scatter', 'sineNode', '-count', 'four')
    except RuntimeError as refused:
        print(f'scatter sineNode -count four -> {refused}')


show_registrations()
node = show_sine_nodes()
show_command(node)
show_data()
show_translator()
show_deformer()
show_locator_and_transform()
show_scatter()
show_point_cloud()
show_threads()
