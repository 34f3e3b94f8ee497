"""Commands as a script runs them: the host reads the command line against the
command's syntax before doIt, refuses misuse naming the flag or argument, and
gives the command's result back as Python values."""

COMMANDS = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

class Echo(vpx.VPxCommand):
    # Its arguments as doIt receives them, as its result.
    def doIt(self, args):
        vpx.VPxCommand.clearResult()
        for i in range(args.length()):
            vpx.VPxCommand.appendToResult(args.asString(i))

class Unchecked(Echo):
    def hasSyntax(self):
        return False

def syntax():
    s = ov.VSyntax()
    s.addFlag('-c', '-count', ov.VSyntax.kLong)
    s.addFlag('-p', '-position', ov.VSyntax.kDouble, ov.VSyntax.kDouble, ov.VSyntax.kDouble)
    s.addFlag('-on', '-enabled', ov.VSyntax.kBoolean)
    s.addFlag('-t', '-tag', ov.VSyntax.kString)
    s.makeFlagMultiUse('-tag')
    s.addFlag('-v', '-verbose')
    s.addArg(ov.VSyntax.kUnsigned)
    s.setObjectType(ov.VSyntax.kStringObjects, 1)
    s.setMaxObjects(2)
    s.enableQuery()
    return s

class Numbers(vpx.VPxCommand):
    def doIt(self, args):
        kind = args.asString(0)
        if kind == 'ints':
            for i in (1, 2, 3):
                vpx.VPxCommand.appendToResult(i)
        elif kind == 'doubles':
            vpx.VPxCommand.setResult(0.5)
            vpx.VPxCommand.appendToResult(1.5)
        elif kind == 'int':
            vpx.VPxCommand.setResult(7)
        elif kind == 'flag':
            vpx.VPxCommand.setResult(args.flagIndex('-x') == ov.VArgList.kInvalidArgIndex)

def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.registerCommand('echo', Echo, syntax)
    plugin.registerCommand('unchecked', Unchecked, syntax)
    plugin.registerCommand('free', Echo)
    plugin.registerCommand('numbers', Numbers)
    plugin.registerCommand('broken', Echo, lambda: 1 / 0)
    plugin.registerCommand('wrong', Echo, lambda: 'syntax')

def uninitializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    for name in ('echo', 'unchecked', 'free', 'numbers', 'broken', 'wrong'):
        plugin.deregisterCommand(name)
'''


def test_the_host_checks_and_converts_arguments_against_the_syntax(vorla):
    lines = vorla.ok('--plugin', vorla.file('commands.py', COMMANDS), script='''
        import vorla
        print(vorla.run_command('echo', '-count', '3', 2.0, '-p', 1, '2.5', -3, 'a',
                                '-tag', 'x', '-t', 4, '-on', 'yes', '-v', '-q', 'b'))
        for args in [('-zzz', 1, 'a'), ('-count', 'abc', 1, 'a'), ('-count', 2.5, 1, 'a'),
                     ('-p', 1, 'x', 3, 1, 'a'), ('1', 'a', '-p', 1, 2), ('-on', 2, 1, 'a'),
                     ('-c', 1, '-count', 2, 1, 'a'), (-1, 'a'), ('a',), (1,), (1, 'a', 'b', 'c'),
                     (1, 2), ('-q', '-query', 1, 'a')]:
            try:
                vorla.run_command('echo', *args)
            except RuntimeError as e:
                print(e)
        # Without a syntax, or when the command says it has none, nothing is checked.
        print(vorla.run_command('unchecked', '-zzz', 2.5))
        print(vorla.run_command('free', '-zzz', 2))
        for name in ('broken', 'wrong'):
            try:
                vorla.run_command(name, 1)
            except RuntimeError as e:
                print(e, '|', vorla.log()[-1].splitlines()[-1])
        try:
            vorla.run_command('echo', [1, 2])
        except TypeError as e:
            print(e)
        print(vorla.alive('VPxCommand'))
    ''')
    assert lines == [
        # In their places, in their kinds: '-on yes' a boolean, 2.0 an integer.
        "['-count', '3', '2', '-p', '1', '2.5', '-3', 'a', '-tag', 'x', '-t', '4', '-on', "
        "'true', '-v', '-q', 'b']",
        "The command 'echo' has no flag '-zzz'",
        "The flag '-count' of the command 'echo' takes an integer, not 'abc'",
        "The flag '-count' of the command 'echo' takes an integer, not 2.5",
        "Argument 2 of the flag '-p' of the command 'echo' takes a number, not 'x'",
        "The flag '-p' of the command 'echo' takes 3 arguments, not 2",
        "The flag '-on' of the command 'echo' takes a boolean, not 2",
        "The flag '-count' of the command 'echo' may be given only once",
        "Argument 1 of the command 'echo' takes an integer of 0 or more, not -1",
        "Argument 1 of the command 'echo' takes an integer of 0 or more, not 'a'",
        "The command 'echo' takes at least 1 object, not 0",
        "The command 'echo' takes at most 2 objects, not 3",
        "The command 'echo' takes objects by name, not 2",
        "The flag '-query' of the command 'echo' may be given only once",
        "['-zzz', '2.5']",
        "['-zzz', '2']",
        "The syntax creator of the command 'broken' failed | ZeroDivisionError: division by zero",
        "The syntax creator of the command 'wrong' failed | "
        "TypeError: a VSyntax creator must return a VSyntax, not a str",
        "run_command() takes numbers and strings as the command's arguments, not 'list'",
        '0']


def test_results_are_python_values(vorla):
    lines = vorla.ok('--plugin', vorla.file('commands.py', COMMANDS), script='''
        import vorla
        print([vorla.run_command('numbers', kind) for kind in ('ints', 'doubles', 'int', 'flag', '')])
    ''')
    assert lines == ['[[1, 2, 3], [0.5, 1.5], 7, 1, None]']
