"""vorla --check on plug-ins with the faults Python lets pass, and the same
checks as warnings when vorla loads a plug-in."""
import glob
import os

from app_runner import EXAMPLES, ROOT

FAULTY = os.path.join(ROOT, 'tests', 'app', 'faulty')


def faulty(name):
    return os.path.join(FAULTY, name)


def test_each_fault_is_reported_at_its_line(vorla):
    files = sorted(glob.glob(faulty('*.py')))
    done = vorla.run('--check', *files)
    assert (done.returncode, done.stderr) == (1, '')
    a, i, k, n, p = (faulty(f) for f in ('arguments.py', 'inits.py', 'kinds.py',
                                          'near_misses.py', 'pure.py'))
    assert done.stdout.splitlines() == [
        f'{a}:6: Short.compute(self, plug) cannot take the 2 arguments the application passes '
        'to VPxNode.compute',
        f'{a}:9: Short.internalArrayCount(self, plug, context, extra) cannot take the 1 or 2 '
        'arguments the application passes to VPxNode.internalArrayCount',
        f'{a}:25: Keyword.doIt(self, args, *, verbose) cannot take the 1 argument the '
        'application passes to VPxCommand.doIt',
        f'{a}:28: Keyword.undoIt() cannot take the 0 arguments the application passes to '
        'VPxCommand.undoIt',
        f'{i}:6: Forgetful.__init__ does not call VPxCommand.__init__',
        f'{i}:21: Derived.__init__ does not call Careful.__init__',
        f"{k}:5: Node, the creator of registerCommand('node_as_command'), is not a subclass of "
        'VPxCommand',
        f"{k}:14: object_maker, the creator of registerCommand('object'), returns a VObject, "
        'not a subclass of VPxCommand',
        f"{k}:20: none_maker, the creator of registerCommand('none'), returns None, not a "
        'subclass of VPxCommand',
        f"{k}:24: silent_maker, the creator of registerCommand('silent'), returns None, not a "
        'subclass of VPxCommand',
        f"{k}:39: initializePlugin.<locals>.<lambda>, the creator of "
        "registerNode('command_as_node'), returns a Command, not a subclass of VPxNode",
        f'{n}:6: Typo.compte matches no operation of VPxNode: did you mean compute?',
        f'{n}:20: Loose.readAscii matches no operation of VPxData: did you mean readASCII?',
        f'{n}:23: Loose.writeascii matches no operation of VPxData: did you mean writeASCII?',
        f'{p}:5: Half does not define copy, which VPxData leaves to its subclasses',
        f'{p}:5: Half does not define name, which VPxData leaves to its subclasses']


def test_the_examples_and_a_relative_path(vorla):
    done = vorla.run('--check', *sorted(glob.glob(os.path.join(EXAMPLES, '*.py'))))
    assert (done.returncode, done.stdout, done.stderr) == (0, '', '')
    # A file is shown as it was named.
    done = vorla.run('--check', os.path.relpath(faulty('pure.py'), vorla.tmp_path))
    assert done.stdout.splitlines()[0] == (
        os.path.relpath(faulty('pure.py'), vorla.tmp_path) +
        ':5: Half does not define copy, which VPxData leaves to its subclasses')


def test_a_plugin_that_fails_to_load_does_not_stop_the_others(vorla):
    broken = vorla.file('broken.py', 'def initializePlugin(obj)\n    pass\n')
    done = vorla.run('--check', broken, faulty('inits.py'))
    assert done.returncode == 1
    assert done.stderr.splitlines()[-1] == (
        f"vorla: The plug-in file '{broken}' failed to import: SyntaxError: expected ':'")
    assert len(done.stdout.splitlines()) == 2
    done = vorla.run('--check')
    assert (done.returncode, done.stderr.splitlines()[0]) == (
        2, 'vorla: --check needs a plug-in file')


def test_loading_logs_the_findings_as_warnings_and_goes_on(vorla):
    lines = vorla.ok('--plugin', faulty('near_misses.py'), script='''
        import vorla
        print(*vorla.log(), sep='\\n')
        print(vorla.create_node('typo'), vorla.registered())
        ''')
    assert lines == [
        f"{faulty('near_misses.py')}:6: warning: Typo.compte matches no operation of VPxNode: "
        'did you mean compute?',
        f"{faulty('near_misses.py')}:20: warning: Loose.readAscii matches no operation of "
        'VPxData: did you mean readASCII?',
        f"{faulty('near_misses.py')}:23: warning: Loose.writeascii matches no operation of "
        'VPxData: did you mean writeASCII?',
        "typo1 [('Node', 'typo', 'near_misses'), ('Data', 'loose', 'near_misses')]"]
