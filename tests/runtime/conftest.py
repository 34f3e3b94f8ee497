"""Shared fixtures for the object-runtime tests."""

import pytest

import openvorla.OpenVorlaVPx as vpx
from openvorla import _OpenVorlaVPx as m


@pytest.fixture
def register_node_class():
    """Registers a stand-in class on the VPxNode descriptor; the proxy class is restored afterwards."""
    yield m.VPxNode_swigregister
    m.VPxNode_swigregister(vpx.VPxNode)
