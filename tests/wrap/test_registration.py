"""Plug-in registration: callables handed to the host with one reference and
one announcement each, defaults as the host receives them, and a plug-in's
whole life as the application drives it."""
import gc
import sys
import weakref

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx


@pytest.fixture
def plugin():
    yield vpx.VFnPlugin(host.load_plugin('registering', '/plug-ins/registering.py'))
    host.unload_all_plugins()


def registration(name):
    (found,) = [r for r in host.registrations() if r['name'] == name]
    return found


def creator():
    return None


def syntax():
    return None


class TestAnnouncements:
    def test_one_per_callable_passed(self, plugin):
        host.reset_announcements()
        plugin.registerCommand('threeArgs', creator)
        assert host.announcements() == 1
        assert registration('threeArgs')['script_callables'] == 1
        # An explicit None is a callable passed like any other.
        plugin.registerCommand('fourArgs', creator, None)
        assert host.announcements() == 3
        assert registration('fourArgs')['script_callables'] == 2

    def test_transform_announces_its_callables_before_the_matrix_id(self, plugin):
        host.reset_announcements()
        with pytest.raises(TypeError) as e:
            plugin.registerTransform('xform', ov.VTypeId(0x81), creator, creator, creator, 'no id')
        assert str(e.value) == ("in method 'VFnPlugin_registerTransform', argument 7 of type "
                                "'VTypeId const &'")
        assert host.announcements() == 3

    def test_ui_procedures_are_neither_referenced_nor_announced(self, plugin):
        host.reset_announcements()
        before = sys.getrefcount(creator)
        plugin.registerUI(creator, creator)
        assert host.announcements() == 0 and sys.getrefcount(creator) == before


class TestReferences:
    def test_the_host_holds_one_reference_until_it_deregisters(self, plugin):
        def make():
            return None
        before = sys.getrefcount(make)
        plugin.registerCommand('refs', make)
        assert sys.getrefcount(make) == before + 1
        plugin.deregisterCommand('refs')
        assert sys.getrefcount(make) == before

    def test_a_failing_registration_keeps_the_callables_referenced_only_by_the_host(self, plugin):
        plugin.registerCommand('twice', creator)
        with pytest.raises(RuntimeError) as e:
            plugin.registerCommand('twice', syntax)
        assert str(e.value) == "The name 'twice' is in use by the command 'twice'"


class TestDefaults:
    def test_image_file_priority(self, plugin):
        plugin.registerImageFile('pix', creator, ['pix'])
        assert registration('pix')['flags'] == vpx.VFnPlugin.kImageFilePriorityDefault == 10
        plugin.registerImageFile('raw', creator, ['raw'], vpx.VFnPlugin.kImageFilePriorityLow)
        assert registration('raw')['flags'] == 20

    def test_node_type_and_classification(self, plugin):
        plugin.registerNode('plainNode', ov.VTypeId(0x90), creator, creator)
        assert (registration('plainNode')['flags'], registration('plainNode')['classification']) \
            == (vpx.VPxNode.kDependNode, '')
        plugin.registerNode('locator', ov.VTypeId(0x91), creator, creator,
                            vpx.VPxNode.kLocatorNode, 'drawdb/geometry')
        assert (registration('locator')['flags'], registration('locator')['classification']) \
            == (1, 'drawdb/geometry')

    def test_a_plugin_made_from_an_object_alone(self):
        made = vpx.VFnPlugin(host.load_plugin('defaults', '/p.py'))
        assert (made.vendor(), made.version(), made.apiVersion()) == ('Unknown', 'Unknown', 'Any')
        host.unload_all_plugins()


PLUGIN = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

made = []


class Sine(vpx.VPxNode):
    type_id = ov.VTypeId(0x7A01)

    def compute(self, plug, block):
        made.append(('compute', id(self)))
        return None


class Hello(vpx.VPxCommand):
    def doIt(self, args):
        made.append(('doIt', args.asString(0)))
        vpx.VPxCommand.setResult('hello ' + args.asString(0))


def sine_creator():
    return Sine()


def sine_initializer():
    return None


def hello_creator():
    return Hello()


def initializePlugin(obj):
    plugin = vpx.VFnPlugin(obj, 'Tests', '1.0')
    plugin.registerNode('sineNode', Sine.type_id, sine_creator, sine_initializer)
    plugin.registerCommand('hello', hello_creator)


def uninitializePlugin(obj):
    plugin = vpx.VFnPlugin(obj)
    plugin.deregisterCommand('hello')
    plugin.deregisterNode(Sine.type_id)
'''


def test_a_plugin_from_registration_to_unloading(tmp_path):
    namespace = {}
    exec(compile(PLUGIN, str(tmp_path / 'sine.py'), 'exec'), namespace)
    creators = [namespace[n] for n in ('sine_creator', 'sine_initializer', 'hello_creator')]
    refs = [sys.getrefcount(c) for c in creators]
    nodes_before, commands_before = host.alive('VPxNode'), host.alive('VPxCommand')
    obj = host.load_plugin('sine', str(tmp_path / 'sine.py'))

    namespace['initializePlugin'](obj)
    assert [sys.getrefcount(c) for c in creators] == [r + 1 for r in refs]
    assert host.initialize_node('sineNode') == 0

    node = host.create_node('sineNode')
    command = host.create_command('hello')
    assert host.call(node, 'VPxNode::compute', ov.VPlug(), ov.VDataBlock()) == 0
    assert host.call(command, 'VPxCommand::doIt', 'world') == 0
    assert vpx.VPxCommand.currentStringResult() == 'hello world'
    made = namespace['made']
    assert [m[0] for m in made] == ['compute', 'doIt'] and made[1][1] == 'world'

    # The Python instances live exactly as long as the host's objects.
    instances = [weakref.ref(o) for o in gc.get_objects()
                 if type(o).__name__ in ('Sine', 'Hello')]
    assert len(instances) == 2
    host.delete_node(node)
    host.delete_command(command)
    gc.collect()
    assert all(r() is None for r in instances)
    assert (host.alive('VPxNode'), host.alive('VPxCommand')) == (nodes_before, commands_before)

    namespace['uninitializePlugin'](obj)
    assert not [r for r in host.registrations() if r['plugin'] == 'sine']
    assert [sys.getrefcount(c) for c in creators] == refs
    host.unload_all_plugins()


def test_lookups_answer_from_the_registry(plugin):
    assert not vpx.VFnPlugin.isNodeRegistered('lookedUp')
    plugin.registerNode('lookedUp', ov.VTypeId(0x92), creator, creator)
    assert vpx.VFnPlugin.isNodeRegistered('lookedUp')
    assert vpx.VFnPlugin(vpx.VFnPlugin.findPlugin('registering')).name() == 'registering'
    plugin.deregisterNode(ov.VTypeId(0x92))
    assert not vpx.VFnPlugin.isNodeRegistered('lookedUp')
