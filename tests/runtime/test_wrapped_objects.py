"""SwigPyObject: printed form, comparison, ownership, the "this" chain and destruction."""

import sys

import pytest
import vorlatesthost as host

import openvorla.OpenVorla as ov
import openvorla.OpenVorlaVPx as vpx
from openvorla import _OpenVorlaVPx as m

NOSHADOW = 0x2  # wrap without making a proxy instance


def alias(address, type_name="_p_VPxNode"):
    """A bare, non-owning wrapper of `address` (never dereferenced)."""
    return host.new_pointer_obj(address, type_name, NOSHADOW)


class Holder:
    pass


def test_repr_prints_every_link_of_the_chain():
    node = vpx.VPxNode()
    head = node.this
    extra = alias(int(head), "_p_VObject")
    head.append(extra)
    assert repr(head) == (
        f"<Swig Object of type 'VPxNode *' at {hex(id(head))}>"
        f"<Swig Object of type 'VObject *' at {hex(id(extra))}>"
    )
    assert head.__repr__() == repr(head)


def test_wrappers_compare_by_address_and_are_unhashable():
    node, other = vpx.VPxNode(), vpx.VPxNode()
    a, b = alias(int(node.this)), alias(int(node.this))
    assert a is not b
    assert a == b and not (a != b)
    assert a == node.this and a != other.this
    assert a != "not a wrapper"
    assert int(a) == host.convert_ptr(node, "_p_VPxNode", 0)[1] != 0
    with pytest.raises(TypeError) as excinfo:
        a < b
    assert str(excinfo.value) == "'<' not supported between instances of 'SwigPyObject' and 'SwigPyObject'"
    with pytest.raises(TypeError) as excinfo:
        hash(a)
    assert str(excinfo.value) == "unhashable type: 'SwigPyObject'"


def test_own_reports_the_previous_state_and_changes_it():
    w = m.new_VPxNode(None)
    try:
        assert w.own() is True
        assert w.own(0) is True
        assert w.own() is False
        assert w.acquire() is None and w.own() is True
        assert w.disown() is None and w.own() is False

        class Undecidable:
            def __bool__(self):
                raise RuntimeError("no truth")

        # A value whose truth cannot be decided asks for ownership.
        assert w.own(Undecidable()) is False
        assert w.own() is True
        with pytest.raises(TypeError) as excinfo:
            w.own(1, 2)
        assert str(excinfo.value) == "own expected at most 1 argument, got 2"
    finally:
        m.delete_VPxNode(w)


def test_append_inserts_directly_behind_the_receiver():
    head, first, second = alias(0x10), alias(0x20), alias(0x30)
    head.append(first)
    head.append(second)
    assert head.next() is second
    assert second.next() is first
    assert first.next() is None
    # A sibling module's wrapper is a wrapper too.
    sibling = ov.VObject().this
    first.append(sibling)
    assert first.next() is sibling

    with pytest.raises(TypeError) as excinfo:
        head.append(5)
    assert str(excinfo.value) == "Attempt to append a non SwigPyObject"
    with pytest.raises(ValueError) as excinfo:
        head.append(first)
    assert str(excinfo.value) == "Attempt to append a SwigPyObject already in the chain"
    assert head.next() is second and second.next() is first


def test_swiginit_sets_this_once_then_extends_the_chain():
    holder = Holder()
    first, second = alias(0x10), alias(0x20)
    assert m.VPxNode_swiginit(holder, first) is None
    assert holder.this is first
    assert m.VPxNode_swiginit(holder, second) is None
    assert holder.this is first and first.next() is second
    with pytest.raises(TypeError) as excinfo:
        m.VPxNode_swiginit(holder, 5)
    assert str(excinfo.value) == "Attempt to append a non SwigPyObject"


def test_this_is_followed_through_nested_proxies():
    node = vpx.VPxNode()
    outer = Holder()
    outer.this = node
    assert host.convert_ptr(outer, "_p_VPxNode", 0)[:2] == (0, int(node.this))


def test_only_an_owning_wrapper_destroys_its_object():
    destroyed = host.destroyed("VPxNode")
    w = m.new_VPxNode(None)
    del w
    assert host.destroyed("VPxNode") == destroyed + 1

    w = m.new_VPxNode(None)
    w.disown()
    address = int(w)
    del w
    assert host.destroyed("VPxNode") == destroyed + 1
    m.delete_VPxNode(alias(address))
    assert host.destroyed("VPxNode") == destroyed + 2

    # A proxy's whole chain goes with it.
    node = vpx.VPxNode()
    node.this.append(m.new_VPxNode(None))
    del node
    assert host.destroyed("VPxNode") == destroyed + 4


def test_owning_wrapper_without_destructor_reports_a_leak(capfd, register_node_class):
    class NoDestructor:
        pass

    register_node_class(NoDestructor)
    alive = host.alive("VPxNode")
    w = m.new_VPxNode(None)
    address = int(w)
    capfd.readouterr()
    del w
    assert capfd.readouterr().out == (
        "swig/python detected a memory leak of type 'VPxNode *', no destructor found.\n"
    )
    assert host.alive("VPxNode") == alive + 1
    m.delete_VPxNode(alias(address))


def test_failing_destructor_is_unraisable_and_keeps_the_pending_error(monkeypatch, register_node_class):
    class FailingDestructor:
        def __swig_destroy__(wrapper):
            assert wrapper.own() is False  # a stand-in, never the dying wrapper
            m.delete_VPxNode(wrapper)
            raise ValueError("destructor failed")

    register_node_class(FailingDestructor)
    unraisable = []
    monkeypatch.setattr(sys, "unraisablehook", unraisable.append)
    destroyed = host.destroyed("VPxNode")
    # The argument tuple, the only holder of the new wrapper, is released
    # while the count error is already pending.
    with pytest.raises(TypeError) as excinfo:
        m.VPxNode_swiginit(m.new_VPxNode(None))
    assert str(excinfo.value) == "swiginit expected 2 arguments, got 1"
    assert [str(u.exc_value) for u in unraisable] == ["destructor failed"]
    assert unraisable[0].object is FailingDestructor.__swig_destroy__
    assert host.destroyed("VPxNode") == destroyed + 1
