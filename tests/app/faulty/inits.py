"""__init__ methods with and without their base's."""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Forgetful(vpx.VPxCommand):
    def __init__(self):
        self.count = 0


class Careful(vpx.VPxCommand):
    def __init__(self):
        super().__init__()


class Explicit(vpx.VPxCommand):
    def __init__(self):
        vpx.VPxCommand.__init__(self)


class Derived(Careful):
    def __init__(self, count=0):
        self.count = count


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    for name, cls in [('forgetful', Forgetful), ('careful', Careful), ('explicit', Explicit),
                      ('derived', Derived)]:
        plugin.registerCommand(name, cls)


def uninitializePlugin(obj):
    pass
