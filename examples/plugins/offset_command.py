"""An undoable command, offsetAttr: adds an offset to a numeric attribute.

    vorla.run_command('offsetAttr', 'sineNode1.input', 0.25)   # -> 0.75
    vorla.run_command('offsetAttr', 'sineNode1.input', 2, '-times', 3)
    vorla.undo()    # the attribute is back to its old value
    vorla.redo()

The command reaches the graph through the application's own scripting module
`vorla`, as any script does.
"""
import vorla

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class OffsetCommand(vpx.VPxCommand):
    name = 'offsetAttr'

    def __init__(self):
        super().__init__()
        self.plug = ''
        self.old = self.new = 0.0

    @staticmethod
    def syntax():
        # offsetAttr PLUG OFFSET [-times N]
        syntax = ov.VSyntax()
        syntax.addArg(ov.VSyntax.kString)
        syntax.addArg(ov.VSyntax.kDouble)
        syntax.addFlag('-t', '-times', ov.VSyntax.kLong)
        return syntax

    def doIt(self, args):
        # The host has checked the arguments against the syntax; the command
        # remembers what it needs to redo and undo itself.
        self.plug = args.asString(0)
        offset = args.asDouble(1)
        times = args.flagIndex('-t', '-times')
        if times != ov.VArgList.kInvalidArgIndex:
            offset *= args.asInt(times + 1)
        self.old = vorla.get_attr(self.plug)
        self.new = self.old + offset
        return self.redoIt()

    def redoIt(self):
        vorla.set_attr(self.plug, self.new)
        vpx.VPxCommand.setResult(self.new)

    def undoIt(self):
        vorla.set_attr(self.plug, self.old)

    def isUndoable(self):
        # Kept by the application for undo() and redo() after doIt().
        return True


def create():
    return OffsetCommand()


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'Vorla Examples', '1.0')
    plugin.registerCommand(OffsetCommand.name, create, OffsetCommand.syntax)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterCommand(OffsetCommand.name)
