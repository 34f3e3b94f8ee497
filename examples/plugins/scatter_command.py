"""A command with flags, scatter: makes nodes of a type and spreads a value
of theirs at random; undo deletes them again.

    vorla.run_command('scatter', 'sineNode', '-count', 3, '-seed', 7,
                      '-attribute', 'input', '-range', 0, 1)
    # -> ['sineNode1', 'sineNode2', 'sineNode3']

    scatter TYPE [-c/-count N] [-s/-seed N] [-a/-attribute NAME]
            [-r/-range LOW HIGH] [-p/-prefix TEXT]

The host checks the command line against the syntax before doIt: an
unknown flag, a count that is not a whole number or a missing range bound
never reach the command, and the script gets the host's message. doIt
reads the flags it was given through VArgList.flagIndex.
"""
import random

import vorla

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


def syntax():
    s = ov.VSyntax()
    s.addArg(ov.VSyntax.kString)
    s.addFlag('-c', '-count', ov.VSyntax.kUnsigned)
    s.addFlag('-s', '-seed', ov.VSyntax.kLong)
    s.addFlag('-a', '-attribute', ov.VSyntax.kString)
    s.addFlag('-r', '-range', ov.VSyntax.kDouble, ov.VSyntax.kDouble)
    s.addFlag('-p', '-prefix', ov.VSyntax.kString)
    return s


def flag(args, short, long, read, default):
    """The argument after the flag, or the default when it was not given."""
    at = args.flagIndex(short, long)
    return default if at == ov.VArgList.kInvalidArgIndex else read(at + 1)


class Scatter(vpx.VPxCommand):
    name = 'scatter'

    def __init__(self):
        super().__init__()
        self.made = []

    def doIt(self, args):
        self.type_name = args.asString(0)
        self.count = flag(args, '-c', '-count', args.asInt, 1)
        self.seed = flag(args, '-s', '-seed', args.asInt, 0)
        self.attribute = flag(args, '-a', '-attribute', args.asString, '')
        self.prefix = flag(args, '-p', '-prefix', args.asString, '')
        at = args.flagIndex('-r', '-range')
        self.range = ((0.0, 1.0) if at == ov.VArgList.kInvalidArgIndex
                      else (args.asDouble(at + 1), args.asDouble(at + 2)))
        return self.redoIt()

    def redoIt(self):
        rng = random.Random(self.seed)
        self.made = []
        try:
            for i in range(self.count):
                name = f'{self.prefix}{i + 1}' if self.prefix else None
                self.made.append(vorla.create_node(self.type_name, name))
                if self.attribute:
                    vorla.set_attr(f'{self.made[-1]}.{self.attribute}', rng.uniform(*self.range))
        except RuntimeError:
            self.undoIt()  # nothing half made stays behind
            raise
        vpx.VPxCommand.clearResult()
        for made in self.made:
            vpx.VPxCommand.appendToResult(made)

    def undoIt(self):
        for name in reversed(self.made):
            vorla.delete_node(name)
        self.made = []

    def isUndoable(self):
        return True


def initializePlugin(obj):
    vpx.VFnPlugin(obj, 'Vorla Examples', '1.0').registerCommand(Scatter.name, Scatter, syntax)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterCommand(Scatter.name)
