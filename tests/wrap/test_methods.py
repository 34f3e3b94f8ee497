"""The proxy classes' methods: descriptors that call the module's built-in
with the instance in place, exactly as the built-in called directly."""
import pydoc

import pytest

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m
from openvorla import _methods


def outcome(call):
    try:
        return ('ok', call())
    except Exception as e:  # noqa: BLE001 - the exception is the outcome
        return (type(e), str(e))


@pytest.mark.parametrize('args', [(), (ov.VPlug(),), (ov.VPlug(), ov.VDataBlock(), 3),
                                  (None, None), ('x', 7)])
def test_through_an_instance_as_through_the_built_in(args):
    node = vpx.VPxNode()
    assert outcome(lambda: node.compute(*args)) == outcome(lambda: m.VPxNode_compute(node, *args))


def test_keywords_and_a_missing_self_are_the_built_ins_errors():
    node = vpx.VPxNode()
    assert outcome(lambda: node.typeName(x=1)) == outcome(lambda: m.VPxNode_typeName(node, x=1))
    assert outcome(lambda: vpx.VPxNode.typeName()) == outcome(lambda: m.VPxNode_typeName())


def test_bound_through_an_instance_and_itself_through_the_class():
    node = vpx.VPxNode()
    bound = node.isAbstractClass
    assert bound() is False and bound.__self__ is node
    descriptor = vars(vpx.VPxNode)['isAbstractClass']
    assert type(descriptor) is _methods.method
    assert vpx.VPxNode.isAbstractClass is descriptor
    assert descriptor.__wrapped__ is m.VPxNode_isAbstractClass
    assert descriptor.__name__ == 'VPxNode_isAbstractClass'
    # A static member is the built-in itself.
    assert vpx.VPxNode.className is m.VPxNode_className


def test_an_override_reaches_the_base_through_the_class():
    class Node(vpx.VPxNode):
        def isAbstractClass(self):
            return not vpx.VPxNode.isAbstractClass(self)
    assert Node().isAbstractClass() is True


def test_help_renders():
    text = pydoc.render_doc(vpx.VPxNode, renderer=pydoc.plaintext)
    assert 'isAbstractClass' in text
