"""The application from its command line: usage, the embedded interpreter,
the script's exit status, and plug-ins loaded, listed and unloaded."""
import os

from app_runner import BUILD

COUNTER = '''
from openvorla import OpenVorlaVPx as vpx


class Count(vpx.VPxCommand):
    pass


def initializePlugin(obj):
    vpx.VFnPlugin(obj).registerCommand('count', Count)
    print('init', vpx.VFnPlugin(obj).name())


def uninitializePlugin(obj):
    print('uninit', vpx.VFnPlugin(obj).name())
'''


FRAGILE = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Fragile(vpx.VPxNode):
    input = output = None

    def compute(self, plug, data):
        x = data.inputValue(Fragile.input).asDouble()
        if x < 0:
            raise ArithmeticError(f'no square root of {x}')
        out = data.outputValue(Fragile.output)
        out.setDouble(x ** 0.5)
        out.setClean()


made = []


def create():
    made.append(None)
    if len(made) == 2:
        raise LookupError('the second node is one too many')
    return Fragile()


def initialize():
    numeric = ov.VFnNumericAttribute()
    Fragile.input = numeric.create('input', 'in', ov.VFnNumericData.kDouble, 0.0)
    Fragile.output = numeric.create('output', 'out', ov.VFnNumericData.kDouble, 0.0)
    numeric.setWritable(False)
    vpx.VPxNode.addAttribute(Fragile.input)
    vpx.VPxNode.addAttribute(Fragile.output)
    vpx.VPxNode.attributeAffects(Fragile.input, Fragile.output)


def initializePlugin(obj):
    vpx.VFnPlugin(obj).registerNode('fragile', ov.VTypeId(0x7A1F0), create, initialize)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(ov.VTypeId(0x7A1F0))
'''


class TestCommandLine:
    def test_help(self, vorla):
        done = vorla.run('--help')
        assert done.returncode == 0 and done.stderr == ''
        assert done.stdout.startswith(
            'usage: vorla [--plugin FILE]... [--threads N] [-i] [SCRIPT [ARGS...]]\n'
            '       vorla --check PLUGIN...\n'
            '       vorla --help\n')

    def test_usage_errors_exit_with_status_2(self, vorla):
        for args, message in [(['--threads', '0'], '--threads takes a number from 1 to 256'),
                              (['--threads', '4x'], '--threads takes a number from 1 to 256'),
                              (['--plugin'], '--plugin needs a value'),
                              (['--verbose', 's.py'], "unknown option '--verbose'")]:
            done = vorla.run(*args)
            assert (done.returncode, done.stderr.splitlines()[0]) == (2, 'vorla: ' + message)

    def test_the_script_runs_as_main_in_debians_python_whatever_the_environment(
            self, vorla, tmp_path):
        # A json module on PYTHONPATH and a python3 first on PATH must both be ignored.
        shadow = tmp_path / 'shadow'
        shadow.mkdir()
        (shadow / 'json.py').write_text('raise SystemExit("the environment leaked in")\n')
        (shadow / 'python3').write_text('#!/bin/sh\nexit 1\n')
        (shadow / 'python3').chmod(0o755)
        env = dict(os.environ, PYTHONPATH=str(shadow), PYTHONHOME=str(shadow),
                   PATH=f'{shadow}:{os.environ["PATH"]}')
        lines = vorla.ok(script='''
            import json, sys, openvorla, vorla
            print(__name__, sys.argv[1:], sys.executable)
            print(json.__file__.startswith('/usr/lib/python3.11/'))
            print(openvorla.__file__)
            ''', env=env)
        assert lines == ['__main__ [] /usr/bin/python3', 'True',
                         os.path.join(BUILD, 'python', 'openvorla', '__init__.py')]

    def test_arguments_after_the_script_are_its_own(self, vorla):
        script = vorla.file('args.py', 'import sys; print(sys.argv[1:])')
        assert vorla.ok(script, '--plugin', 'x', '--help') == ["['--plugin', 'x', '--help']"]

    def test_exit_status_follows_the_script(self, vorla):
        done = vorla.run(script='1 / 0')
        assert done.returncode == 1
        assert done.stderr.startswith('Traceback (most recent call last):\n')
        assert done.stderr.endswith('ZeroDivisionError: division by zero\n')
        assert vorla.run(script='raise SystemExit(3)').returncode == 3
        done = vorla.run(script='import sys; sys.exit("giving up")')
        assert (done.returncode, done.stderr) == (1, 'giving up\n')
        done = vorla.run('missing.py')
        assert done.returncode == 2 and done.stderr.startswith("vorla: cannot open script")

    def test_without_a_script_stdin_is_the_script_and_i_opens_the_prompt(self, vorla):
        counter = vorla.file('counter.py', COUNTER)
        # vorla is imported for it, as at the prompt.
        done = vorla.run('--plugin', counter, stdin='print(vorla.plugins())\nexit(4)\n')
        assert (done.returncode, done.stdout) == (4, "init counter\n['counter']\nuninit counter\n")
        # -i after the script: the script's names are there; exit() ends the prompt, and the
        # plug-ins are unloaded all the same.
        done = vorla.run('-i', '--plugin', counter, script='x = 6', merged=True,
                         stdin='print(x * 7, vorla.plugins())\n1 / 0\nexit(5)\n')
        lines = done.stdout.splitlines()
        assert done.returncode == 5
        assert lines[0] == 'init counter' and lines[-1] == '>>> uninit counter'
        assert lines[1].startswith('vorla, Python 3.11.') and lines[1].endswith('; plug-ins: counter')
        assert lines[2:4] == [">>> 42 ['counter']", '>>> Traceback (most recent call last):']
        assert lines[-2] == 'ZeroDivisionError: division by zero'

    def test_output_comes_in_the_order_written_and_logging_goes_to_the_log(self, vorla):
        done = vorla.run('--plugin', vorla.file('counter.py', COUNTER), script="""
            import logging, vorla
            print('first')
            logging.getLogger('scene').info('second %d', 2)
            print('third')
            vorla.run_command('nothing')
            """, merged=True)
        assert done.stdout.splitlines()[:5] == [
            'init counter', 'first', 'Info: scene: second 2', 'third',
            'Traceback (most recent call last):']


class TestPlugins:
    def test_loaded_listed_and_unloaded_the_last_first(self, vorla):
        first = vorla.file('counter.py', COUNTER)
        second = vorla.file('other.py', COUNTER.replace("'count'", "'other'"))
        lines = vorla.ok('--plugin', first, script=f'''
            import vorla
            print(vorla.load_plugin({second!r}))
            print(vorla.plugins(), vorla.registered())
            ''')
        assert lines == ['init counter', 'init other', 'other',
                         "['counter', 'other'] "
                         "[('Command', 'count', 'counter'), ('Command', 'other', 'other')]",
                         'uninit other', 'uninit counter']

    def test_unloading_forgets_registrations_and_the_module(self, vorla):
        lines = vorla.ok('--plugin', vorla.file('counter.py', COUNTER), script='''
            import gc, sys, vorla
            vorla.unload_plugin('counter')
            gc.collect()
            print(vorla.plugins(), vorla.registered(), 'counter' in sys.modules)
            print([type(o).__name__ for o in gc.get_objects() if type(o).__name__ == 'Count'])
            ''')
        assert lines == ['init counter', 'uninit counter', '[] [] False', '[]']

    def test_refusals_raise_runtime_error_with_the_reason(self, vorla):
        path = vorla.file('counter.py', COUNTER)
        lines = vorla.ok('--plugin', path, script=f'''
            import vorla
            for call, arg in [(vorla.load_plugin, {path!r}), (vorla.load_plugin, 'nowhere.py'),
                              (vorla.unload_plugin, 'nobody')]:
                try:
                    call(arg)
                except RuntimeError as e:
                    print(e)
            ''')
        assert lines[1:4] == [f"The plug-in 'counter' is loaded from '{path}' already",
                              "No plug-in file 'nowhere.py'",
                              "No plug-in named 'nobody' is loaded"]


class TestFailingPlugins:
    """An exception in plug-in code is written to the log with its traceback;
    the operation fails, and the application goes on."""

    def test_a_failing_plugin_is_reported_with_its_traceback_and_the_application_goes_on(
            self, vorla):
        failing = vorla.file('failing.py', '''
            from openvorla import OpenVorlaVPx as vpx

            def creator():
                return None

            def initializePlugin(obj):
                vpx.VFnPlugin(obj).registerCommand('halfway', creator)
                raise ValueError('no licence for ' + vpx.VFnPlugin(obj).name())
            ''')
        broken = vorla.file('broken.py', 'def initializePlugin(obj)\n    pass\n')
        leaving = vorla.file('leaving.py', COUNTER.replace(
            "print('uninit', ", "raise KeyError('still busy', "))
        done = vorla.run(script=f'''
            import vorla
            for path in ({failing!r}, {broken!r}, {leaving!r}):
                try:
                    vorla.load_plugin(path)
                except RuntimeError as e:
                    print(e)
            print(vorla.plugins(), vorla.registered())
            vorla.unload_plugin('leaving')
            print(vorla.plugins(), vorla.registered())
            for entry in vorla.log():
                print(entry.splitlines()[-1])
            ''')
        assert done.returncode == 0, done.stderr
        assert done.stdout.splitlines() == [
            "initializePlugin of the plug-in 'failing' failed: ValueError: no licence for failing",
            f"The plug-in file '{broken}' failed to import: SyntaxError: expected ':'",
            'init leaving',
            "['leaving'] [('Command', 'count', 'leaving')]",
            '[] []',
            'ValueError: no licence for failing',
            "SyntaxError: expected ':'",
            "KeyError: ('still busy', 'leaving')"]
        assert ("Python exception in plug-in 'failing', in initializePlugin, loading the plug-in:\n"
                'Traceback (most recent call last):\n'
                f'  File "{failing}", line 9, in initializePlugin\n') in done.stderr
        assert f'  File "{leaving}", line 15, in uninitializePlugin\n' in done.stderr

    def test_a_plugin_of_the_command_line_that_fails_stops_the_application(self, vorla):
        broken = vorla.file('broken.py', 'def initializePlugin(obj)\n    pass\n')
        for plugin in (broken, vorla.tmp_path / 'missing.py'):
            done = vorla.run('--plugin', str(plugin), script='print("ran")')
            assert done.returncode == 1 and done.stdout == ''
        assert done.stderr == f"vorla: No plug-in file '{plugin}'\n"

    def test_a_raising_creator_or_compute_fails_that_node_only(self, vorla):
        fragile = vorla.file('fragile.py', FRAGILE)
        done = vorla.run('--plugin', fragile, script='''
            import vorla

            def attempt(call, *args):
                try:
                    return call(*args)
                except RuntimeError as e:
                    print(e)
                    print(vorla.log()[-1].splitlines()[-1])

            print(attempt(vorla.create_node, 'fragile'))
            attempt(vorla.create_node, 'fragile')
            print(attempt(vorla.create_node, 'fragile'))
            vorla.set_attr('fragile1.input', -4)
            vorla.set_attr('fragile2.input', 9)
            attempt(vorla.get_attr, 'fragile1.output')
            print(vorla.get_attr('fragile2.output'))
            vorla.set_attr('fragile2.input', 16)
            attempt(vorla.evaluate, 2)
            print(vorla.get_attr('fragile2.output'))
            vorla.set_attr('fragile1.input', 4)
            print(vorla.get_attr('fragile1.output'), vorla.nodes())
            ''')
        assert done.returncode == 0, done.stderr
        assert done.stdout.splitlines() == [
            'fragile1',
            "The creator of the node type 'fragile' made no node: "
            "LookupError: the second node is one too many",
            'LookupError: the second node is one too many',
            'fragile2',
            "Computing 'fragile1.output' failed: ArithmeticError: no square root of -4.0",
            'ArithmeticError: no square root of -4.0',
            '3.0',
            "Computing 'fragile1.output' failed: ArithmeticError: no square root of -4.0",
            'ArithmeticError: no square root of -4.0',
            '4.0',
            "2.0 [('fragile1', 'fragile', 3), ('fragile2', 'fragile', 2)]"]
        assert (f'  File "{fragile}", line 23, in create\n'
                "    raise LookupError('the second node is one too many')\n") in done.stderr
        assert (f'  File "{fragile}", line 11, in compute\n'
                "    raise ArithmeticError(f'no square root of {x}')\n") in done.stderr
