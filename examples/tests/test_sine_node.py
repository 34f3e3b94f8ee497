"""A plug-in's own tests, run by pytest in a plain Python process: the
application runs inside the test process, as the vorla program runs it.

    PYTHONPATH=<vorla>/python /usr/bin/python3 -m pytest examples/tests

(<vorla>/python: the folder that holds the openvorla and vorla packages,
build/python in this project.)
"""
import math
import os

import pytest

import vorla
from vorla import testing

PLUGINS = os.path.join(os.path.dirname(os.path.dirname(os.path.abspath(__file__))), 'plugins')
SINE = os.path.join(PLUGINS, 'sine_node.py')


@pytest.fixture
def sine():
    with testing.loaded(SINE):
        yield


def test_output_follows_input_and_amplitude(sine):
    node = vorla.create_node('sineNode')
    vorla.set_attr(node + '.input', 0.5)
    vorla.set_attr(node + '.amplitude', 3)
    assert vorla.get_attr(node + '.output') == 3 * math.sin(0.5)


def test_nodes_compute_on_host_threads(sine):
    nodes = [vorla.create_node('sineNode') for _ in range(100)]
    for i, node in enumerate(nodes):
        vorla.set_attr(node + '.input', i / 100)
    vorla.evaluate(threads=4)
    assert [vorla.get_attr(n + '.output') for n in nodes] == [math.sin(i / 100) for i in range(100)]


def test_the_output_cannot_be_set(sine):
    node = vorla.create_node('sineNode')
    with pytest.raises(RuntimeError) as refused:
        vorla.set_attr(node + '.output', 1.0)
    assert str(refused.value) == f"The plug '{node}.output' is not writable"


def test_each_test_starts_from_nothing(sine):
    assert vorla.plugins() == ['sine_node'] and vorla.nodes() == []
