"""Argument counts, overload dispatch and the messages of each failure kind."""
import pytest

from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m

ROTATE_TO = (
    "Wrong number or type of arguments for overloaded function 'VPxTransformationMatrix_rotateTo'.\n"
    "  Possible C/C++ prototypes are:\n"
    "    VPxTransformationMatrix::rotateTo(VQuaternion const &,VSpace::Space)\n"
    "    VPxTransformationMatrix::rotateTo(VEulerRotation const &,VSpace::Space)\n")


def error(call, *args):
    with pytest.raises(Exception) as e:
        call(*args)
    return type(e.value), str(e.value)


def test_counts_without_a_qualifier(plugin):
    assert error(m.VFnPlugin_removeMenuItem, plugin, [], 3) == (
        TypeError, 'VFnPlugin_removeMenuItem expected 2 arguments, got 3')
    assert error(m.VFnPlugin_removeMenuItem) == (
        TypeError, 'VFnPlugin_removeMenuItem expected 2 arguments, got 0')


def test_counts_with_a_range():
    assert error(m.VPxNode_getFilesToArchive) == (
        TypeError, 'VPxNode_getFilesToArchive expected at least 1 arguments, got 0')
    assert error(m.VPxNode_getFilesToArchive, vpx.VPxNode(), 1, 2, 3, 4) == (
        TypeError, 'VPxNode_getFilesToArchive expected at most 4 arguments, got 5')


def test_the_dispatcher_chooses_by_the_first_differing_argument(matrix, quaternion):
    unrotated = vpx.VPxTransformationMatrix()
    assert matrix.rotateTo(quaternion) is None
    assert matrix.isEquivalent(unrotated)
    # A half turn about x, given as angles, reaches the host's other overload.
    assert matrix.rotateTo(ov.VEulerRotation(3.141592653589793, 0.0, 0.0), 1) is None
    assert not matrix.isEquivalent(unrotated)


def test_an_overloaded_count_error_gains_the_prototypes(matrix):
    assert error(m.VPxTransformationMatrix_rotateTo, matrix, 1, 2, 3) == (
        TypeError, 'VPxTransformationMatrix_rotateTo expected at most 3 arguments, got 4\n'
                   'Additional information:\n' + ROTATE_TO)
    assert error(m.VPxTransformationMatrix_rotateTo, matrix) == (TypeError, ROTATE_TO)


def test_a_type_error_in_the_last_candidate_gains_the_prototypes(matrix):
    assert error(matrix.rotateTo, 5) == (
        TypeError, "in method 'VPxTransformationMatrix_rotateTo', argument 2 of type "
                   "'VEulerRotation const &'\nAdditional information:\n" + ROTATE_TO)


def test_other_errors_of_a_candidate_stay_as_they_are(matrix, quaternion):
    # None never selects a candidate by reference; the last one refuses it.
    assert error(matrix.rotateTo, None) == (
        ValueError, "invalid null reference in method 'VPxTransformationMatrix_rotateTo', "
                    "argument 2 of type 'VEulerRotation const &'")
    assert error(matrix.rotateTo, quaternion, 2 ** 31) == (
        OverflowError, "in method 'VPxTransformationMatrix_rotateTo', argument 3 of type "
                       "'VSpace::Space'")


def test_self(matrix):
    # A generic conversion failure of argument 1 is a type error.
    assert error(m.VPxNode_typeName, matrix) == (
        TypeError, "in method 'VPxNode_typeName', argument 1 of type 'VPxNode const *'")
    # A null self could only crash the call: it is refused as a null reference.
    assert error(m.VPxNode_setMPSafe, None, True) == (
        ValueError, "invalid null reference in method 'VPxNode_setMPSafe', argument 1 of type "
                    "'VPxNode *'")


def test_static_members_count_their_first_argument_as_one():
    assert error(m.VPxNode_addAttribute, 5) == (
        TypeError, "in method 'VPxNode_addAttribute', argument 1 of type 'VObject const &'")
    assert error(m.VPxNode_addAttribute, None) == (
        ValueError, "invalid null reference in method 'VPxNode_addAttribute', argument 1 of type "
                    "'VObject const &'")
