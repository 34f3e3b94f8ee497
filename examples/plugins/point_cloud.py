"""A node, pointCloud: places a cloud of points by a matrix and measures it.

    node = vorla.create_node('pointCloud')
    vorla.set_attr(node + '.points', [[0, 0, 0], [2, 0, 0], [1, 3, 0]])
    vorla.set_attr(node + '.placement', [[1, 0, 0, 0], [0, 1, 0, 0],
                                         [0, 0, 1, 0], [5, 0, 0, 1]])
    vorla.get_attr(node + '.placed')     # the points moved 5 along x
    vorla.get_attr(node + '.centroid')   # [6.0, 1.0, 0.0]
    vorla.get_attr(node + '.radius')     # from the centroid to the farthest point

The host's points, vectors, matrices and arrays are Python values: a point
array is indexed, measured with len() and iterated as a list is, p * m places
a point by a matrix, p - q is the vector from q to p, and a list or a numpy
array stands for a point, a vector, a matrix or an array wherever the host
takes one. Attributes compare and hash as the host objects they name, so
compute() looks up in a dict what to do for the plug it is asked for.
"""
import numpy as np

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class PointCloud(vpx.VPxNode):
    type_name, type_id = 'pointCloud', ov.VTypeId(0x7A213)
    # Its attributes, made by initialize().
    points = placement = ov.VObject()
    placed = centroid = radius = ov.VObject()
    writers: dict = {}

    def compute(self, plug, data):
        write = PointCloud.writers.get(plug.attribute())
        if write is None:
            return 'unknown'  # not a plug this node computes
        points = ov.VFnPointArrayData(data.inputValue(PointCloud.points).data()).array()
        matrix = data.inputValue(PointCloud.placement).asMatrix()
        placed = ov.VPointArray([p * matrix for p in points])
        write(data.outputValue(plug.attribute()), placed)
        data.setClean(plug)


def centroid_of(placed):
    """The mean of the points, as a point: numpy reads the array as an
    (n, 4) array of x, y, z and w."""
    xyz = np.array(placed)[:, :3] if len(placed) else np.zeros((1, 3))
    return ov.VPoint(xyz.mean(axis=0))


def write_placed(out, placed):
    out.setMObject(ov.VFnPointArrayData().create(placed))


def write_centroid(out, placed):
    out.setMVector(centroid_of(placed).asVector())


def write_radius(out, placed):
    center = centroid_of(placed)
    out.setDouble(max(((p - center).length() for p in placed), default=0.0))


def initialize():
    typed, numeric = ov.VFnTypedAttribute(), ov.VFnNumericAttribute()
    PointCloud.points = typed.create('points', 'pts', ov.VFnData.kPointArray)
    PointCloud.placement = typed.create('placement', 'pm', ov.VFnData.kMatrix)
    PointCloud.placed = typed.create('placed', 'pd', ov.VFnData.kPointArray)
    typed.setWritable(False)
    PointCloud.centroid = numeric.createPoint('centroid', 'ct')
    numeric.setWritable(False)
    PointCloud.radius = numeric.create('radius', 'r', ov.VFnNumericData.kDouble, 0.0)
    numeric.setWritable(False)
    PointCloud.writers = {PointCloud.placed: write_placed, PointCloud.centroid: write_centroid,
                          PointCloud.radius: write_radius}
    for attribute in (PointCloud.points, PointCloud.placement, *PointCloud.writers):
        vpx.VPxNode.addAttribute(attribute)
    for source in (PointCloud.points, PointCloud.placement):
        for output in PointCloud.writers:
            vpx.VPxNode.attributeAffects(source, output)


def initializePlugin(obj):
    vpx.VFnPlugin(obj, 'Vorla Examples', '1.0').registerNode(
        PointCloud.type_name, PointCloud.type_id, PointCloud, initialize)


def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(PointCloud.type_id)
