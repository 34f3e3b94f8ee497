"""Registrations whose creators do not make what their kind needs."""
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


class Node(vpx.VPxNode):
    pass


class Command(vpx.VPxCommand):
    pass


def object_maker():
    return ov.VObject()


def none_maker(flag=False):
    if flag:
        return Command()
    return None


def silent_maker():
    Command()


def unknowable_maker():
    made = [Command()]
    return made[0]


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.registerCommand('node_as_command', Node)
    plugin.registerCommand('object', object_maker)
    plugin.registerCommand('none', none_maker)
    plugin.registerCommand('silent', silent_maker)
    plugin.registerCommand('unknowable', unknowable_maker)
    plugin.registerNode('command_as_node', ov.VTypeId(0x7A520), lambda: Command(), lambda: None)


def uninitializePlugin(obj):
    pass
