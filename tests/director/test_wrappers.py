"""Proxy-class wrappers with directors: construction, upcalls, protected
members, hand-over to the host and destruction."""
import gc
import sys

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m

REFUSED = 'accessing abstract class or protected constructor'


class TestConstruction:
    def test_none_builds_a_plain_object_or_is_refused(self):
        plain = m.new_VPxNode(None)
        assert 'VPxNode *' in repr(plain) and plain.own()
        m.delete_VPxNode(plain)
        with pytest.raises(RuntimeError) as e:
            m.new_VPxData(None)
        assert str(e.value) == REFUSED

    def test_a_subclass_instance_gets_a_director(self):
        calls = []

        class Node(vpx.VPxNode):
            def isAbstractClass(self):
                calls.append(self)
                return True

        class Data(vpx.VPxData):          # abstract for Python's None, not for a subclass
            def name(self):
                return 'data'
        node = Node()
        assert host.call(node, 'VPxNode::isAbstractClass') is True and calls == [node]
        assert host.call(Data(), 'VPxData::name') == 'data'


class TestUpcalls:
    def test_an_override_reaching_the_base_runs_the_host_once(self):
        calls = []

        class Node(vpx.VPxNode):
            def compute(self, plug, block):
                calls.append(1)
                return vpx.VPxNode.compute(self, plug, block)
        assert host.call(Node(), 'VPxNode::compute', ov.VPlug(), ov.VDataBlock()) == 5
        assert calls == [1]

    def test_a_pure_virtual_base_raises_in_python(self):
        class Data(vpx.VPxData):
            def name(self):
                return vpx.VPxData.name(self)
        kind, received, error = host.call(Data(), 'VPxData::name')
        assert received == ''
        assert 'SWIG director pure virtual method called VPxData::name' in '\n'.join(
            host.log_entries())


class Transform(vpx.VPxTransform):
    def __init__(self):
        super().__init__()
        self.results = []

    def applyTranslationLocks(self, to_test, saved):
        self.results.append(vpx.VPxTransform.applyTranslationLocks(self, to_test, saved))
        return self.results[-1]


class TestProtectedMembers:
    def test_refused_outside_its_own_override(self):
        transform = Transform()
        for target in (transform, vpx.VPxTransform()):
            with pytest.raises(RuntimeError) as e:
                m.VPxTransform_applyTranslationLocks(target, ov.VVector(), ov.VVector())
            assert str(e.value) == 'accessing protected member applyTranslationLocks'

    def test_open_inside_its_own_override(self):
        transform = Transform()
        status = host.call(transform, 'VPxTransform::checkAndSetTranslation', ov.VDataBlock(),
                           ov.VPlug(), ov.VVector(1.0, 2.0, 3.0))
        assert status == 0 and len(transform.results) == 1
        assert 'VVector' in repr(transform.results[0])

    def test_a_protected_member_without_an_override_stays_closed(self):
        with pytest.raises(RuntimeError) as e:
            vpx.VPxTransform.dirtyTranslation(Transform(), ov.VVector())
        assert str(e.value) == 'accessing protected member dirtyTranslation'


class TestHandOver:
    def test_disown_twice_keeps_one_reference_until_the_host_deletes(self):
        class Node(vpx.VPxNode):
            pass
        node = Node()
        before = sys.getrefcount(node)
        alive = host.alive('VPxNode')
        node.__disown__()
        m.disown_VPxNode(node)
        assert sys.getrefcount(node) == before + 1 and not node.thisown
        host.host_delete(node, '_p_VPxNode')
        assert sys.getrefcount(node) == before and host.alive('VPxNode') == alive - 1

    def test_disown_of_a_plain_object_changes_nothing(self):
        plain = vpx.VPxNode()
        assert m.disown_VPxNode(plain) is None and plain.thisown

    def test_a_disowned_instance_lives_as_long_as_the_host_object(self):
        class Node(vpx.VPxNode):
            def isAbstractClass(self):
                return True
        node = Node()
        node.__disown__()
        keep = node.this
        del node
        gc.collect()
        assert host.call(keep, 'VPxNode::isAbstractClass') is True
        host.host_delete(keep, '_p_VPxNode')

    def test_make_obj_hands_its_object_to_the_host(self):
        made = []

        class Command(vpx.VPxContextCommand):
            def makeObj(self):
                made.append(vpx.VPxContext())
                return made[-1]
        address = host.call(Command(), 'VPxContextCommand::makeObj')
        context = made[0]
        assert address == int(context.this) and not context.thisown
        alive = host.alive('VPxContext')
        del made[:], context
        gc.collect()
        assert host.alive('VPxContext') == alive   # the host keeps it

    def test_delete_of_an_object_python_does_not_own_still_deletes_it(self):
        node = vpx.VPxNode()
        node.this.disown()
        alive = host.alive('VPxNode')
        m.delete_VPxNode(node)
        assert host.alive('VPxNode') == alive - 1
