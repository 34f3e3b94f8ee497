"""The director base: the reference it holds on its Python instance, its
ownership records, the protected-member table and the director exceptions."""

import sys
import weakref

import pytest
import vorlatesthost as host


class Instance:
    pass


def test_disown_holds_one_reference_until_the_host_deletes_the_object():
    obj = Instance()
    before = sys.getrefcount(obj)
    h = host.make_director(obj)
    assert sys.getrefcount(obj) == before
    host.director_disown(h)
    host.director_disown(h)
    assert sys.getrefcount(obj) == before + 1
    host.director_delete(h)
    assert sys.getrefcount(obj) == before


def test_python_owned_director_leaves_the_instance_alone():
    obj = Instance()
    before = sys.getrefcount(obj)
    host.director_delete(host.make_director(obj))
    assert sys.getrefcount(obj) == before


def test_host_keeps_a_disowned_instance_alive_and_frees_it_without_the_lock():
    obj = Instance()
    h = host.make_director(obj)
    host.director_disown(h)
    gone = weakref.ref(obj)
    del obj
    assert gone() is not None
    # The last reference goes inside the destructor; the deallocation (and
    # this weak reference's clearing) needs the lock the destructor takes.
    host.director_delete(h, True)
    assert gone() is None


def test_protected_member_table():
    h = host.make_director(Instance())
    assert host.director_inner(h, "compute") is False
    host.director_set_inner(h, "compute", True)
    assert host.director_inner(h, "compute") is True
    assert host.director_inner(h, "doIt") is False
    host.director_set_inner(h, "compute", False)
    assert host.director_inner(h, "compute") is False
    assert host.base_inner("compute") is True
    host.director_delete(h)


def test_ownership_records_are_kept_once_and_freed_with_the_director():
    h = host.make_director(Instance())
    host.own_array(h, 3)  # each buffer offered twice: a second holder would free it twice
    host.own_object(h, 0x1000, 3)
    host.own_object(h, 0x1000, 1)  # the first record stays
    host.own_object(h, 0x2000, 0)  # not owned: nothing to record
    host.own_object(h, 0, 1)
    assert sorted(host.owner_records(h)) == [0, 0, 0, 3]
    host.own_counted(h, 4)
    destroyed = host.counted_destroyed()
    host.director_delete(h)
    assert host.counted_destroyed() == destroyed + 4


SELF = "'self' uninitialized, maybe you forgot to call VPxNode.__init__."
PURE = "SWIG director pure virtual method called"
MISMATCH = "SWIG director type mismatch"
NULL_REF = "invalid null reference in output value of type 'VObject &'"


@pytest.mark.parametrize(
    "args, caught, what, error",
    [
        (("plain", ValueError, "header"), "DirectorException", "header", ValueError),
        (("plain", ValueError, "header", "detail"), "DirectorException", "header detail", ValueError),
        (("raise", SELF), "DirectorException", SELF, RuntimeError),
        (("pure", "VPxData::copy"), "DirectorPureVirtualException", PURE + " VPxData::copy",
         RuntimeError),
        (("raise_pure", "VPxData::copy"), "DirectorPureVirtualException", PURE + " VPxData::copy",
         RuntimeError),
        (("pure",), "DirectorPureVirtualException", PURE, RuntimeError),
        (("mismatch", TypeError, "in output value of type 'bool'"), "DirectorTypeMismatchException",
         MISMATCH + " in output value of type 'bool'", TypeError),
        (("raise_mismatch", ValueError, NULL_REF), "DirectorTypeMismatchException",
         MISMATCH + " " + NULL_REF, ValueError),
        (("mismatch", TypeError), "DirectorTypeMismatchException", MISMATCH, TypeError),
    ],
)
def test_exception_text_and_the_python_error(args, caught, what, error):
    assert host.director_exception(None, *args) == (caught, what, error, what)
    # An error already pending explains the failure better: it stays as it was.
    pending = host.director_exception(KeyError("first"), *args)
    assert pending == (caught, what, KeyError, "'first'")
