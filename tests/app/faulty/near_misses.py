"""Methods the application never calls: their names miss an operation's."""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Typo(vpx.VPxNode):
    def compte(self, plug, data):
        return None

    def helper(self):  # far from every operation: the plug-in's own
        return None

    def _compute_cache(self):
        return None


class Loose(vpx.VPxData):
    def copy(self, source):
        pass

    def readAscii(self, args, last):
        pass

    def writeascii(self, out):
        pass

    def typeId(self):
        return ov.VTypeId(0x7A501)

    def name(self):
        return 'loose'


class Again(Typo):
    def compte(self, plug, data):  # reported where it is first defined
        return None


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.registerNode('typo', ov.VTypeId(0x7A500), Again, lambda: None)
    plugin.registerData('loose', ov.VTypeId(0x7A501), Loose)


def uninitializePlugin(obj):
    pass
