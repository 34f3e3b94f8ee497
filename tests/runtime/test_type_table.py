"""Descriptor lookup, the table shared with the sibling module, and its capsule."""

import os
import subprocess
import sys
import textwrap

import vorlatesthost as host

import openvorla.OpenVorla as ov
import openvorla.OpenVorlaVPx as vpx
from openvorla import _OpenVorlaVPx as m

NOSHADOW = 0x2  # wrap without making a proxy instance


def run_python(code):
    env = dict(os.environ, PYTHONPATH=os.pathsep.join(p for p in sys.path if p))
    return subprocess.run(
        [sys.executable, "-c", textwrap.dedent(code)], env=env, capture_output=True, text=True, timeout=60
    )


def test_lookup_by_mangled_or_readable_name_ignores_spacing():
    expected = ("_p_VPxNode", "VPxNode *")
    for spelling in ("_p_VPxNode", "VPxNode *", "VPxNode*", " VPxNode  * "):
        assert host.type_query(spelling) == expected
    assert host.type_query("char*")[0] == "_p_char"
    assert host.type_query("VPxNode **") is None
    assert host.type_query("NoSuchType *") is None


def test_joining_merges_cast_lists_and_shares_class_records():
    holders = [{name for name, _, _ in t} for t in host.modules()]
    for name in set.intersection(*holders):
        sources = host.cast_list(name)
        assert len(sources) == len(set(sources)), name
    # VObject's class is registered by the sibling module; this module's own
    # static variables reach it only through the shared record.
    assert type(m.cvar.VPxNode_message) is ov.VObject
    assert type(host.new_pointer_obj(0x10, "_p_VObject", 0)) is ov.VObject


def test_each_module_has_its_own_wrapper_type():
    mine, theirs = vpx.VPxNode().this, ov.VObject().this
    assert type(mine) is not type(theirs)
    assert type(mine).__name__ == type(theirs).__name__ == "SwigPyObject"
    assert host.convert_ptr(theirs, "_p_VObject", 0)[:2] == (0, int(theirs))


def test_table_is_published_in_the_runtime_capsule():
    capsule = sys.modules["swig_runtime_data4"].type_pointer_capsule
    assert repr(capsule).startswith('<capsule object "swig_runtime_data4.type_pointer_capsule" at ')


def test_owning_wrappers_hold_the_capsule_only_while_they_live():
    capsule = sys.modules["swig_runtime_data4"].type_pointer_capsule
    before = sys.getrefcount(capsule)
    node, obj = vpx.VPxNode(), ov.VObject()
    # Whichever module installed the table, its owning wrappers hold it.
    assert sys.getrefcount(capsule) > before
    borrowed = host.new_pointer_obj(int(node.this), "_p_VPxNode", NOSHADOW)
    node.this.disown()
    borrowed.acquire()
    obj.this.own(0)
    obj.this.own(1)
    del node, obj, borrowed
    assert sys.getrefcount(capsule) == before


def test_class_records_outlive_the_capsule_entry_until_the_last_owner_dies():
    result = run_python(
        """
        import gc, sys
        import openvorla.OpenVorla as ov, openvorla.OpenVorlaVPx as vpx
        import vorlatesthost as host
        obj, node = ov.VObject(), vpx.VPxNode()
        address = int(obj.this)
        print(type(host.new_pointer_obj(address, "_p_VObject", 0)).__name__)
        del sys.modules["swig_runtime_data4"].type_pointer_capsule
        gc.collect()
        print(type(host.new_pointer_obj(address, "_p_VObject", 0)).__name__)
        del obj, node
        gc.collect()
        print(type(host.new_pointer_obj(address, "_p_VObject", 0)).__name__)
        """
    )
    assert result.returncode == 0, result.stderr
    assert result.stdout.split() == ["VObject", "VObject", "SwigPyObject"]


def test_interpreter_exits_cleanly_with_wrappers_alive():
    result = run_python(
        """
        import openvorla.OpenVorla as ov, openvorla.OpenVorlaVPx as vpx
        from openvorla import _OpenVorlaVPx as m
        import vorlatesthost as host
        owned = [vpx.VPxNode(), vpx.VPxDeformerNode(), ov.VObject(), m.new_VPxNode(None)]
        moved = vpx.VPxNode()
        taker = host.new_pointer_obj(int(moved.this), "_p_VPxNode", 2)
        moved.this.disown()
        taker.acquire()
        """
    )
    assert result.returncode == 0, result.stderr
