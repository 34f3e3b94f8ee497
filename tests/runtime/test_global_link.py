"""The cvar link object: printed forms and attribute access by name."""

import pytest

from openvorla import _OpenVorlaVPx as m


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

