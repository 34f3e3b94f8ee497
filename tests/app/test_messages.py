"""What a user reads when a plug-in fails: the log names the plug-in, the
code and what the application was doing, and the RuntimeError a script sees
ends with the Python exception."""

FAILING = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Raiser(vpx.VPxNode):
    input = output = None

    def compute(self, plug, data):
        return self.check(data.inputValue(Raiser.input).asDouble())

    def check(self, x):
        raise ValueError(f'bad input {x}')


class Unready(vpx.VPxNode):
    def __init__(self):
        self.ready = False


class Undoer(vpx.VPxCommand):
    def doIt(self, args):
        pass

    def isUndoable(self):
        return True

    def undoIt(self):
        raise KeyError('nothing kept')


class Data(vpx.VPxData):
    def typeId(self):
        return ov.VTypeId(0x7A540 if self.copies else 0x7A541)

    def name(self):
        return 'typo' if self.copies else 'copyless'


class Typo(Data):
    copies = True

    def copy(self, source):
        pass

    def readAscii(self, args, last):
        pass


class Copyless(Data):
    copies = False

    def readASCII(self, args, last):
        pass


def made_object():
    return ov.VObject()


def initialize():
    numeric = ov.VFnNumericAttribute()
    Raiser.input = numeric.create('input', 'in', ov.VFnNumericData.kDouble, 0.0)
    Raiser.output = numeric.create('output', 'out', ov.VFnNumericData.kDouble, 0.0)
    vpx.VPxNode.addAttribute(Raiser.input)
    vpx.VPxNode.addAttribute(Raiser.output)
    vpx.VPxNode.attributeAffects(Raiser.input, Raiser.output)


def initialize_nothing():
    raise RuntimeError('no attributes today')


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.registerNode('raiser', ov.VTypeId(0x7A542), Raiser, initialize)
    plugin.registerNode('unready', ov.VTypeId(0x7A543), Unready, initialize)
    plugin.registerNode('nothing', ov.VTypeId(0x7A544), Raiser, initialize_nothing)
    plugin.registerCommand('undoer', Undoer)
    plugin.registerCommand('objects', made_object)
    plugin.registerData('typo', ov.VTypeId(0x7A540), Typo)
    plugin.registerData('copyless', ov.VTypeId(0x7A541), Copyless)


def uninitializePlugin(obj):
    pass
'''


def test_each_failure_says_where_and_why(vorla):
    done = vorla.run('--plugin', vorla.file('failing.py', FAILING), script='''
        import vorla

        def attempt(call, *args):
            mark = len(vorla.log())
            try:
                call(*args)
            except RuntimeError as e:
                print(e)
            for entry in vorla.log()[mark:]:
                lines = entry.splitlines()
                print(lines[0], '|', lines[-1])

        vorla.create_node('raiser', 'r')
        vorla.set_attr('r.input', 2)
        attempt(vorla.get_attr, 'r.output')
        attempt(vorla.create_node, 'unready')
        attempt(vorla.create_node, 'nothing')
        attempt(vorla.run_command, 'undoer')
        attempt(vorla.undo)
        attempt(vorla.run_command, 'objects')
        attempt(vorla.round_trip_data, 'typo', '1')
        attempt(vorla.round_trip_data, 'copyless', '1')
        ''')
    assert done.returncode == 0, done.stderr
    assert done.stdout.splitlines() == [
        "Computing 'r.output' failed: ValueError: bad input 2.0",
        "Python exception in plug-in 'failing', in Raiser.compute, computing 'r.output': | "
        'ValueError: bad input 2.0',
        "The creator of the node type 'unready' made no node: "
        'TypeError: Unready did not call VPxNode.__init__',
        "Python exception in plug-in 'failing', in Unready, creating a node of the type "
        "'unready': | TypeError: Unready did not call VPxNode.__init__",
        "The initializer of the node type 'nothing' failed: RuntimeError: no attributes today",
        "Python exception in plug-in 'failing', in initialize_nothing, initializing the node "
        "type 'nothing': | RuntimeError: no attributes today",
        "Undoing the command 'undoer' failed: KeyError: 'nothing kept'",
        "Python exception in plug-in 'failing', in Undoer.undoIt, undoing the command "
        "'undoer': | KeyError: 'nothing kept'",
        "The creator of the command 'objects' made no command: "
        'TypeError: the creator returned a VObject, not a subclass of VPxCommand',
        "Python exception in plug-in 'failing', in made_object, creating the command "
        "'objects': | TypeError: the creator returned a VObject, not a subclass of VPxCommand",
        # Methods the plug-in did not define: no traceback, but the class and method.
        "Reading the data type 'typo' from ASCII failed: RuntimeError: Not implemented",
        "Python exception in plug-in 'failing', in Typo.readASCII, reading the data type "
        "'typo' from ASCII: | RuntimeError: Not implemented",
        "Copying the data type 'copyless' failed: "
        'RuntimeError: SWIG director pure virtual method called VPxData::copy',
        "Python exception in plug-in 'failing', in Copyless.copy, copying the data type "
        "'copyless': | RuntimeError: SWIG director pure virtual method called VPxData::copy"]
    # The traceback goes down to the line that raised.
    assert ('  File "{0}", line 9, in compute\n'
            '    return self.check(data.inputValue(Raiser.input).asDouble())\n'
            '           ^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^^\n'
            '  File "{0}", line 12, in check\n'
            "    raise ValueError(f'bad input {{x}}')\n").format(
                vorla.tmp_path / 'failing.py') in done.stderr
