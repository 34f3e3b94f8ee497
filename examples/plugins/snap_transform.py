"""A transform with its own matrix, snapTransform: its translation snaps to
a grid of half units.

    node = vorla.create_node('snapTransform')
    vorla.set_attr(node + '.translate', [1.2, 0.3, -0.8])
    vorla.get_attr(node + '.matrix')[3]   # [1.0, 0.5, -1.0, 1.0]

The host composes a transform's matrix from its translate, rotate and scale
through the transformation matrix the transform made: here a Python subclass
of VPxTransformationMatrix, which rounds the translation it is given before
the base class keeps it.
"""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

GRID = 0.5


class SnapMatrix(vpx.VPxTransformationMatrix):
    type_id = ov.VTypeId(0x7A214)

    def translateTo(self, vector, space):
        snapped = ov.VVector(*(round(c / GRID) * GRID for c in (vector.x, vector.y, vector.z)))
        return vpx.VPxTransformationMatrix.translateTo(self, snapped, space)


class SnapTransform(vpx.VPxTransform):
    type_name, type_id = 'snapTransform', ov.VTypeId(0x7A212)

    def createTransformationMatrix(self):
        return SnapMatrix()


def initializePlugin(obj):
    vpx.VFnPlugin(obj, 'Vorla Examples', '1.0').registerTransform(
        SnapTransform.type_name, SnapTransform.type_id, SnapTransform, lambda: None, SnapMatrix,
        SnapMatrix.type_id)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(SnapTransform.type_id)
