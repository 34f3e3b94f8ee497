"""Host objects the conversion tests call into."""
import itertools

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

_names = itertools.count()


@pytest.fixture
def plugin():
    """A VFnPlugin attached to a plug-in the host has just loaded."""
    obj = host.load_plugin(f'convert{next(_names)}', '/plug-ins/convert.py')
    yield vpx.VFnPlugin(obj)
    host.unload_all_plugins()


@pytest.fixture
def matrix():
    return vpx.VPxTransformationMatrix()


@pytest.fixture
def quaternion():
    return ov.VQuaternion()
