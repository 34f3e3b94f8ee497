"""The cvar link object: printed forms and attribute access by name."""

import pytest

from openvorla import OpenVorla as ov, _OpenVorlaVPx as m


def test_link_prints_its_variables_newest_first():
    assert repr(m.cvar) == "<Swig global variables>"
    text = str(m.cvar)
    assert text.startswith(
        "(VPxParticleAttributeMapperNode_outValuePP, VPxParticleAttributeMapperNode_outColorPP, "
    )
    assert text.endswith(", VFnPlugin_kDefaultDataLocation)")
    assert text.count(", ") == 479


def test_unknown_names_raise_attribute_error():
    with pytest.raises(AttributeError) as excinfo:
        m.cvar.VPxNode_nosuch
    assert str(excinfo.value) == "Unknown C global variable 'VPxNode_nosuch'"
    with pytest.raises(AttributeError) as excinfo:
        m.cvar.VPxNode_nosuch = 1
    assert str(excinfo.value) == "Unknown C global variable 'VPxNode_nosuch'"


def test_setter_errors_reach_python_unchanged():
    with pytest.raises(AttributeError) as excinfo:
        m.cvar.VFnPlugin_kDefaultDataLocation = "elsewhere"
    assert str(excinfo.value) == "Variable VFnPlugin_kDefaultDataLocation is read-only."
    with pytest.raises(ValueError) as excinfo:
        m.cvar.VPxNode_caching = None
    assert str(excinfo.value) == "invalid null reference in variable 'VPxNode::caching' of type 'VObject'"
    # Deletion hands the setter no value at all.
    with pytest.raises(TypeError) as excinfo:
        del m.cvar.VPxNode_caching
    assert str(excinfo.value) == "in variable 'VPxNode::caching' of type 'VObject'"



class TestStaticVariables:
    """Getters wrap the host's statics without copying; setters assign."""

    def test_reads_point_at_the_static_itself(self):
        first, second = m.cvar.VPxNode_message, m.cvar.VPxNode_message
        assert first is not second and int(first.this) == int(second.this)
        assert not first.thisown
        assert m.cvar.VPxNode_message != m.cvar.VPxNode_caching

    def test_assigning_an_object_copies_it_into_the_static(self):
        original = ov.VObject(m.cvar.VPxNode_caching)
        try:
            value = m.cvar.VPxNode_message
            m.cvar.VPxNode_caching = value
            assert m.cvar.VPxNode_caching == m.cvar.VPxNode_message
            assert int(m.cvar.VPxNode_caching.this) != int(value.this)   # a copy, not the object
        finally:
            m.cvar.VPxNode_caching = original
        assert original.thisown

    def test_an_integer_is_a_type_error(self):
        with pytest.raises(TypeError) as excinfo:
            m.cvar.VPxNode_caching = 3
        assert str(excinfo.value) == "in variable 'VPxNode::caching' of type 'VObject'"

    def test_type_id_and_read_only_matrix(self):
        with pytest.raises(ValueError) as excinfo:
            m.cvar.VPxTransformationMatrix_baseTransformationMatrixId = None
        assert str(excinfo.value) == ("invalid null reference in variable "
                                      "'VPxTransformationMatrix::baseTransformationMatrixId' of type "
                                      "'VTypeId'")
        with pytest.raises(AttributeError) as excinfo:
            m.cvar.VPxTransformationMatrix_identity = None
        assert str(excinfo.value) == "Variable VPxTransformationMatrix_identity is read-only."
        assert m.cvar.VPxTransformationMatrix_baseTransformationMatrixId.id() == 0x70000
