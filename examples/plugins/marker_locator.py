"""A locator, marker: an arrow two units high that marks a place.

    node = vorla.create_node('marker')
    vorla.set_attr(node + '.localPosition', [1, 0, 2])
    vorla.set_attr(node + '.localScale', [2, 2, 2])
    vorla.get_attr(node + '.nodeBoundingBoxMin')   # [-0.5, 0.0, 1.5]
    vorla.get_attr(node + '.nodeBoundingBoxMax')   # [2.5, 4.0, 2.5]

A locator draws itself and tells the host the box it draws in; the host
places that box at the locator's local position and scale, and keeps it in
nodeBoundingBoxMin and nodeBoundingBoxMax. localPosition, localScale and
the bounding box come with VPxLocatorNode.
"""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Marker(vpx.VPxLocatorNode):
    type_name, type_id = 'marker', ov.VTypeId(0x7A211)

    def isBounded(self):
        return True

    def boundingBox(self):
        # The arrow's shaft and head, in the locator's own space.
        return ov.VBoundingBox(ov.VPoint(-0.75, 0, -0.25), ov.VPoint(0.75, 2, 0.25))

    def compute(self, plug, block):
        return 'unknown'  # the host computes the bounding box


def initializePlugin(obj):
    vpx.VFnPlugin(obj, 'Vorla Examples', '1.0').registerNode(
        Marker.type_name, Marker.type_id, Marker, lambda: None, vpx.VPxNode.kLocatorNode)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(Marker.type_id)
