"""Host strings and string arrays through the scripting engine, status
results, and output lists."""
import sys

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m


def test_status_success_failure_and_unknown(plugin):
    assert plugin.setVersion('1.2') is None
    other = vpx.VFnPlugin(host.load_plugin('taken-name', '/p.py'))
    with pytest.raises(RuntimeError) as e:
        plugin.setName('taken-name', False)
    # The exception's value is exactly the host's error text.
    assert e.value.args == ("The plug-in name 'taken-name' is already in use",)
    # Code 5 is not a failure: the interned "unknown", and nothing raised.
    result = vpx.VPxNode().compute(ov.VPlug(), ov.VDataBlock())
    assert result is sys.intern('unknown')
    del other


def test_text_round_trips_unchanged():
    cmd = vpx.VPxCommand()
    for text in ['polyCube -w 2', 'héllo wörld ✓ 𝄞', '', 'a\0b']:
        cmd.setCommandString(text)
        assert cmd.commandString() == text


def test_a_string_argument_that_does_not_convert_lets_the_call_run(plugin):
    plugin.setVersion('3.0')
    # The host runs with an empty string and succeeds: the call returns a
    # result while its TypeError is still set, which the interpreter reports.
    with pytest.raises(SystemError) as e:
        plugin.setVersion(5)
    assert isinstance(e.value.__cause__, TypeError)
    assert str(e.value.__cause__) == 'Expected a String or Unicode object for argument 2'
    assert plugin.version() == ''
    # When the host then fails, its RuntimeError replaces the TypeError.
    with pytest.raises(RuntimeError) as e:
        plugin.removeMenuItem(['missing', 7])
    assert e.value.__context__ is None


def test_string_array_results(plugin):
    assert vpx.VPxNode().getFilesToArchive() == []
    assert plugin.addMenuItem('Item', 'Main', 'cmd', '', False) == ['Item']


class TestOutputLists:
    def test_rewritten_after_success(self, plugin):
        plugin.addMenuItem('A', 'Main', 'cmd', '', False)
        names = ['A']
        assert plugin.removeMenuItem(names) is None
        assert names == []     # the host leaves only the names it did not find

    def test_untouched_when_the_status_fails(self, plugin):
        names = ['missing', 'other']
        with pytest.raises(RuntimeError):
            plugin.removeMenuItem(names)
        assert names == ['missing', 'other']

    def test_a_tuple_is_refused_after_the_host_ran(self, plugin):
        plugin.addMenuItem('A', 'Main', 'cmd', '', False)
        with pytest.raises(TypeError) as e:
            plugin.removeMenuItem(('A',))
        assert str(e.value) == 'Argument 2 must be a list object'
        with pytest.raises(RuntimeError):   # the host did remove it
            plugin.removeMenuItem(['A'])

    @pytest.mark.parametrize('before, items', [
        (['x', 'y', 'z'], ['a']), (['x'], ['a', 'b', 'c']), (['x', 'y'], []), ([], ['é'])])
    def test_grows_and_shrinks_in_place(self, before, items):
        lst = list(before)
        alias = lst
        host.update_output_list(lst, items)
        assert alias is lst and lst == items

    def test_only_lists(self):
        with pytest.raises(TypeError) as e:
            host.update_output_list(('x',), ['a'])
        assert str(e.value) == 'Argument 3 must be a list object'


def test_status_output_raises_after_the_value_is_made(plugin):
    with pytest.raises(RuntimeError) as e:
        plugin.addMenuItem('', 'Main', 'cmd', '', False)
    assert str(e.value) == 'A menu item needs a name and a parent menu'
    # A constructor whose status fails: the object made is deleted again.
    before = (host.constructed('VFnPlugin'), host.alive('VFnPlugin'))
    with pytest.raises(RuntimeError) as e:
        vpx.VFnPlugin(ov.VObject())
    assert (host.constructed('VFnPlugin'), host.alive('VFnPlugin')) == (before[0] + 1, before[1])
