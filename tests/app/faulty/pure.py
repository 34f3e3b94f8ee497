"""A data type without the operations every data type must have."""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Half(vpx.VPxData):
    def typeId(self):
        return ov.VTypeId(0x7A530)


def initializePlugin(obj):
    vpx.VFnPlugin(obj).registerData('half', ov.VTypeId(0x7A530), Half)


def uninitializePlugin(obj):
    pass
