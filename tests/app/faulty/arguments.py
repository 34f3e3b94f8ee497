"""Operations whose parameters do not fit the application's call."""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Short(vpx.VPxNode):
    def compute(self, plug):
        return None

    def internalArrayCount(self, plug, context, extra):
        return 0


class Fitting(vpx.VPxNode):
    def compute(self, plug, data, extra=None):
        return None

    def internalArrayCount(self, plug):
        return 0

    def connectionMade(self, *args):
        return None


class Keyword(vpx.VPxCommand):
    def doIt(self, args, *, verbose):
        return None

    def undoIt():
        return None


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.registerNode('short', ov.VTypeId(0x7A510), Short, lambda: None)
    plugin.registerNode('fitting', ov.VTypeId(0x7A511), Fitting, lambda: None)
    plugin.registerCommand('keyword', Keyword)


def uninitializePlugin(obj):
    pass
