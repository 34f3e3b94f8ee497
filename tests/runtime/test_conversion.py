"""Pointer conversion in both directions, its flags, and implicit conversion."""

import vorlatesthost as host

import openvorla.OpenVorla as ov
import openvorla.OpenVorlaVPx as vpx
from openvorla import _OpenVorlaVPx as m

# Conversion flags (DISOWN, IMPLICIT_CONV, NO_NULL, CLEAR), wrapping flags
# (OWN, NOSHADOW) and the status bit of a new temporary.
DISOWN, IMPLICIT_CONV, NO_NULL, CLEAR = 0x1, 0x2, 0x4, 0x8
RELEASE = DISOWN | CLEAR
OWN, NOSHADOW = 0x1, 0x2
NEWOBJ = 0x200


def alias(address, type_name="_p_VPxNode"):
    return host.new_pointer_obj(address, type_name, NOSHADOW)


def test_none_is_a_null_pointer_unless_forbidden():
    assert host.convert_ptr(None, "_p_VPxNode", 0) == (0, 0, 0)
    assert host.convert_ptr(None, "_p_VPxNode", NO_NULL)[0] == -13


def test_objects_of_other_types_do_not_convert():
    assert host.convert_ptr(5, "_p_VPxNode", 0)[0] == -1
    assert host.convert_ptr(ov.VObject(), "_p_VPxNode", 0)[0] == -1
    # A base never converts to a derived type.
    assert host.convert_ptr(vpx.VPxNode(), "_p_VPxDeformerNode", 0)[0] == -1


def test_derived_converts_to_every_base_and_moves_to_the_front():
    entries = sorted(host.cast_list("_p_VPxNode"))
    deformer = vpx.VPxDeformerNode()
    address = int(deformer.this)
    assert host.convert_ptr(deformer, "_p_VPxGeometryFilter", 0)[:2] == (0, address)
    assert host.convert_ptr(deformer, "_p_VPxNode", 0)[:2] == (0, address)
    assert host.cast_list("_p_VPxNode")[0] == "_p_VPxDeformerNode"

    assert host.convert_ptr(alias(address, "_p_VPxGeometryFilter"), "_p_VPxNode", 0)[0] == 0
    order = host.cast_list("_p_VPxNode")
    assert order[:2] == ["_p_VPxGeometryFilter", "_p_VPxDeformerNode"]
    assert sorted(order) == entries


def test_conversion_walks_the_chain_to_a_matching_wrapper():
    obj, node = ov.VObject(), vpx.VPxNode()
    obj.this.append(alias(int(node.this)))
    assert host.convert_ptr(obj, "_p_VPxNode", 0)[:2] == (0, int(node.this))
    assert host.convert_ptr(obj, "_p_VObject", 0)[:2] == (0, int(obj.this))


def test_disown_hands_ownership_to_the_caller():
    w = m.new_VPxNode(None)
    address = int(w)
    assert host.convert_ptr(w, "_p_VPxNode", DISOWN) == (0, address, 1)
    assert w.own() is False
    assert host.convert_ptr(w, "_p_VPxNode", 0) == (0, address, 0)
    m.delete_VPxNode(w)


def test_release_takes_the_object_only_from_its_owner():
    node = vpx.VPxNode()
    address = int(node.this)
    borrowed = alias(address)
    assert host.convert_ptr(borrowed, "_p_VPxNode", RELEASE)[0] == -200
    assert int(borrowed) == address and borrowed.own() is False

    assert host.convert_ptr(node, "_p_VPxNode", RELEASE) == (0, address, 1)
    assert int(node.this) == 0 and node.this.own() is False
    destroyed = host.destroyed("VPxNode")
    del node
    assert host.destroyed("VPxNode") == destroyed
    owner = host.new_pointer_obj(address, "_p_VPxNode", OWN)
    assert type(owner) is vpx.VPxNode and owner.this.own() is True
    del owner
    assert host.destroyed("VPxNode") == destroyed + 1


def test_clear_empties_the_wrapper():
    node = vpx.VPxNode()
    borrowed = alias(int(node.this))
    assert host.convert_ptr(borrowed, "_p_VPxNode", CLEAR)[:2] == (0, int(node.this))
    assert int(borrowed) == 0
    assert host.convert_ptr(borrowed, "_p_VPxNode", 0)[:2] == (0, 0)


def test_implicit_conversion_goes_through_the_class(register_node_class):
    class FromInt:
        __swig_destroy__ = m.delete_VPxNode

        def __init__(self, value):
            if not isinstance(value, int):
                raise TypeError("ints only")
            self.this = m.new_VPxNode(None)

    register_node_class(FromInt)
    destroyed = host.destroyed("VPxNode")
    status, address, _ = host.convert_ptr(42, "_p_VPxNode", IMPLICIT_CONV)
    # The temporary is gone but left its object to the caller.
    assert status == NEWOBJ and address != 0
    assert host.destroyed("VPxNode") == destroyed
    m.delete_VPxNode(alias(address))

    # The constructor's error is swallowed; None still means null.
    assert host.convert_ptr("text", "_p_VPxNode", IMPLICIT_CONV)[0] == -1
    assert host.convert_ptr(None, "_p_VPxNode", IMPLICIT_CONV | NO_NULL)[:2] == (0, 0)
    assert host.convert_ptr(42, "_p_VPxNode", 0)[0] == -1


def test_wrapping_makes_a_proxy_without_running_its_constructor():
    node = vpx.VPxNode()
    address = int(node.this)
    constructed = host.constructed("VPxNode")
    proxy = host.new_pointer_obj(address, "_p_VPxNode", 0)
    assert type(proxy) is vpx.VPxNode
    assert int(proxy.this) == address and proxy.this.own() is False
    assert host.constructed("VPxNode") == constructed

    assert type(host.new_pointer_obj(address, "_p_VPxNode", NOSHADOW)).__name__ == "SwigPyObject"
    assert type(host.new_pointer_obj(address, "_p_int", 0)).__name__ == "SwigPyObject"
    assert host.new_pointer_obj(0, "_p_VPxNode", 0) is None
