"""Argument-count messages of tuple entry points, and code-to-exception mapping."""

import pytest

from openvorla import _OpenVorlaVPx as m


@pytest.mark.parametrize(
    "call, message",
    [
        (lambda: m.VPxNode_swiginit(), "swiginit expected 2 arguments, got 0"),
        (lambda: m.VPxNode_swiginit(1), "swiginit expected 2 arguments, got 1"),
        (lambda: m.VPxNode_swiginit(1, 2, 3), "swiginit expected 2 arguments, got 3"),
    ],
)
def test_exact_counts_have_no_qualifier(call, message):
    with pytest.raises(TypeError) as excinfo:
        call()
    assert str(excinfo.value) == message


PROTOTYPES = (
    "Wrong number or type of arguments for overloaded function 'new_VPxMaterialInformation'.\n"
    "  Possible C/C++ prototypes are:\n"
    "    VPxMaterialInformation::VPxMaterialInformation(PyObject *,VObject &)\n"
    "    VPxMaterialInformation::VPxMaterialInformation(PyObject *,VObject &,VObject const &)\n"
)


def test_an_overload_reports_the_count_then_its_prototypes():
    with pytest.raises(TypeError) as excinfo:
        m.new_VPxMaterialInformation(1, 2, 3, 4)
    assert str(excinfo.value) == (
        "new_VPxMaterialInformation expected at most 3 arguments, got 4\n"
        "Additional information:\n" + PROTOTYPES
    )


def test_an_overload_without_a_matching_count_reports_its_prototypes_alone():
    with pytest.raises(TypeError) as excinfo:
        m.new_VPxMaterialInformation(None)
    assert str(excinfo.value) == PROTOTYPES


def test_a_generic_conversion_failure_is_reported_as_a_type_error():
    with pytest.raises(TypeError) as excinfo:
        m.delete_VPxNode(5)
    assert str(excinfo.value) == "in method 'delete_VPxNode', argument 1 of type 'VPxNode *'"
