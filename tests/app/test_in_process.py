"""The application in a plain Python process: `import vorla` starts it there,
and a script behaves as it does in the vorla program."""
import os
import subprocess
import sys

from app_runner import BUILD, example

SCRIPT = f'''
import vorla
print(vorla.load_plugin({example('sine_node.py')!r}), vorla.load_plugin({example('scatter_command.py')!r}))
made = vorla.run_command('scatter', 'sineNode', '-count', 50, '-attribute', 'input')
vorla.evaluate(threads=4)
print(len(made), sorted(set(vorla.evaluation_threads())) == list(range(len(set(vorla.evaluation_threads())))))
print(round(sum(vorla.get_attr(n + '.output') for n in made), 9))
for misuse in [lambda: vorla.set_attr(made[0] + '.output', 1),
               lambda: vorla.run_command('scatter', 'sineNode', '-count', 'x'),
               lambda: vorla.load_plugin('nothing.py')]:
    try:
        misuse()
    except RuntimeError as e:
        print(e)
vorla.undo()
print(vorla.nodes(), vorla.plugins())
'''


def in_process(script, tmp_path):
    path = tmp_path / 'in_process.py'
    path.write_text(script)
    env = dict(os.environ, PYTHONPATH=os.path.join(BUILD, 'python'))
    return subprocess.run([sys.executable, str(path)], capture_output=True, text=True,
                          env=env, cwd=tmp_path, timeout=120)


def test_a_script_gives_the_same_output_in_python_as_in_vorla(vorla, tmp_path):
    done = in_process(SCRIPT, tmp_path)
    assert done.returncode == 0, done.stderr
    assert done.stdout.splitlines() == vorla.ok(script=SCRIPT)
    assert done.stdout.splitlines()[-4:] == [
        "The plug 'sineNode1.output' is not writable",
        "The flag '-count' of the command 'scatter' takes an integer of 0 or more, not 'x'",
        "No plug-in file 'nothing.py'",
        "[] ['sine_node', 'scatter_command']"]


def test_plugins_are_unloaded_when_the_process_ends(tmp_path):
    plugin = tmp_path / 'bye.py'
    plugin.write_text('def initializePlugin(obj):\n    print("hello")\n\n'
                      'def uninitializePlugin(obj):\n    print("bye")\n')
    done = in_process(f'import vorla\nvorla.load_plugin({str(plugin)!r})\nprint("end")\n',
                      tmp_path)
    assert (done.returncode, done.stdout) == (0, 'hello\nend\nbye\n')
