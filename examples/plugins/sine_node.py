"""A dependency-graph node type, sineNode: output = amplitude * sin(input).

    vorla --plugin sine_node.py scene.py

and in the scene script:

    import vorla
    node = vorla.create_node('sineNode')        # 'sineNode1'
    vorla.set_attr(node + '.input', 0.5)
    print(vorla.get_attr(node + '.output'))     # computed on demand
"""
import math

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class SineNode(vpx.VPxNode):
    type_name = 'sineNode'
    # Unique among all node and data types the application knows.
    type_id = ov.VTypeId(0x7A101)

    # The attributes are made once, by initialize(), and shared by every node
    # of the type; each node has its own values of them.
    input = ov.VObject()
    amplitude = ov.VObject()
    output = ov.VObject()

    def postConstructor(self):
        # compute() uses nothing but its data block: the application may run
        # it on several of its threads at once.
        self.setMPSafe(True)

    def compute(self, plug, data):
        # The application asks for one plug at a time. 'unknown' tells it that
        # this node does not compute the plug.
        if plug.attribute() != SineNode.output:
            return 'unknown'
        x = data.inputValue(SineNode.input).asDouble()
        amplitude = data.inputValue(SineNode.amplitude).asDouble()
        result = data.outputValue(SineNode.output)
        result.setDouble(amplitude * math.sin(x))
        result.setClean()
        # Returning None is success; an exception is reported in the
        # application's log with its traceback, and the plug stays dirty.


def create():
    return SineNode()


def initialize():
    numeric = ov.VFnNumericAttribute()
    SineNode.input = numeric.create('input', 'in', ov.VFnNumericData.kDouble, 0.0)
    numeric.setKeyable(True)
    SineNode.amplitude = numeric.create('amplitude', 'amp', ov.VFnNumericData.kDouble, 1.0)
    numeric.setKeyable(True)
    SineNode.output = numeric.create('output', 'out', ov.VFnNumericData.kDouble, 0.0)
    numeric.setWritable(False)  # computed, never set
    numeric.setStorable(False)  # nor saved

    for attribute in (SineNode.input, SineNode.amplitude, SineNode.output):
        vpx.VPxNode.addAttribute(attribute)
    # A change of either input makes the output dirty: it is computed again
    # the next time someone asks for it.
    vpx.VPxNode.attributeAffects(SineNode.input, SineNode.output)
    vpx.VPxNode.attributeAffects(SineNode.amplitude, SineNode.output)


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'Vorla Examples', '1.0')
    plugin.registerNode(SineNode.type_name, SineNode.type_id, create, initialize)


def uninitializePlugin(obj):
    # The application deletes the plug-in's nodes when it unloads it.
    vpx.VFnPlugin(obj).deregisterNode(SineNode.type_id)
