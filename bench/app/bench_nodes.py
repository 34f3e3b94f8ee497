"""Node types for the application benchmark: benchStep, output = input + 1,
computed in Python; benchHash, output = input after hashing a megabyte, work
done outside the interpreter lock."""
import hashlib

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

BLOCK = bytes(1 << 20)


class Step(vpx.VPxNode):
    input = output = None

    def compute(self, plug, data):
        if plug.attribute() != Step.output:
            return 'unknown'
        out = data.outputValue(Step.output)
        out.setDouble(data.inputValue(Step.input).asDouble() + 1.0)
        out.setClean()


class Hash(vpx.VPxNode):
    input = output = None

    def compute(self, plug, data):
        if plug.attribute() != Hash.output:
            return 'unknown'
        hashlib.sha256(BLOCK).digest()   # releases the interpreter lock while it hashes
        out = data.outputValue(Hash.output)
        out.setDouble(data.inputValue(Hash.input).asDouble())
        out.setClean()


def initializer(cls):
    def initialize():
        numeric = ov.VFnNumericAttribute()
        cls.input = numeric.create('input', 'in', ov.VFnNumericData.kDouble, 0.0)
        cls.output = numeric.create('output', 'out', ov.VFnNumericData.kDouble, 0.0)
        numeric.setWritable(False)
        vpx.VPxNode.addAttribute(cls.input)
        vpx.VPxNode.addAttribute(cls.output)
        vpx.VPxNode.attributeAffects(cls.input, cls.output)
    return initialize


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'bench', '1.0')
    plugin.registerNode('benchStep', ov.VTypeId(0x7A900), Step, initializer(Step))
    plugin.registerNode('benchHash', ov.VTypeId(0x7A901), Hash, initializer(Hash))


def uninitializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.deregisterNode(ov.VTypeId(0x7A900))
    plugin.deregisterNode(ov.VTypeId(0x7A901))
