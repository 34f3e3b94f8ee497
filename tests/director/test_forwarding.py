"""The host calling Python overrides: results by kind, failures reported
through the host, the arity test, and methods replaced at run time. Every
behaviour is driven from the host side."""
import sys

import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m

SUCCESS, FAILURE, UNKNOWN = 0, 1, 5


def compute(node):
    return host.call(node, 'VPxNode::compute', ov.VPlug(), ov.VDataBlock())


def node_returning(value):
    class Node(vpx.VPxNode):
        def compute(self, plug, block):
            return value
    return Node()


@pytest.fixture(autouse=True)
def empty_log():
    host.clear_log()
    yield


class TestStatusResults:
    def test_unknown_only_by_identity(self):
        assert compute(node_returning('unknown')) == UNKNOWN
        equal_but_distinct = ''.join(['unk', 'nown'])
        assert equal_but_distinct is not sys.intern('unknown')
        assert compute(node_returning(equal_but_distinct)) == SUCCESS

    @pytest.mark.parametrize('value', [None, 0, False, 'done', b'unknown', ov.VObject()])
    def test_anything_else_is_success(self, value):
        assert compute(node_returning(value)) == SUCCESS

    def test_a_raising_override_fails_after_the_host_reported_it(self):
        class Broken(vpx.VPxNode):
            def compute(self, plug, block):
                raise KeyError('no such attribute here')
        assert compute(Broken()) == FAILURE
        log = '\n'.join(host.log_entries())
        assert "KeyError: 'no such attribute here'" in log and 'Traceback' in log

    def test_without_an_override_the_host_implementation_runs(self):
        class Plain(vpx.VPxNode):
            pass
        assert compute(Plain()) == UNKNOWN


class TestOtherResults:
    def test_bool_takes_only_a_bool(self):
        for value, expected in [(True, True), (1, False), ('yes', False), (None, False)]:
            class Node(vpx.VPxNode):
                def isAbstractClass(self, value=value):
                    return value
            assert host.call(Node(), 'VPxNode::isAbstractClass') is expected

    def test_enumeration(self):
        class Node(vpx.VPxNode):
            def schedulingType(self):
                return vpx.VPxNode.kUntrusted
        assert host.call(Node(), 'VPxNode::schedulingType') == 4

    def test_enumeration_mismatch_is_thrown_into_the_host(self):
        class Node(vpx.VPxNode):
            def schedulingType(self):
                return 'serial'
        kind, what, error = host.call(Node(), 'VPxNode::schedulingType')
        assert kind == 'pending'
        assert what == ('exception', 'SWIG director type mismatch in output value of type '
                                     "'VPxNode::SchedulingType'")
        assert type(error) is TypeError and str(error) == what[1]

    def test_string_array(self):
        class Node(vpx.VPxNode):
            def getFilesToArchive(self, short_name, unresolved, sequence):
                return ['a.tex', 'b.tex']
        assert host.call(Node(), 'VPxNode::getFilesToArchive') == ['a.tex', 'b.tex']

    def test_string_array_of_the_wrong_kind_leaves_a_type_error(self):
        class Node(vpx.VPxNode):
            def getFilesToArchive(self, *flags):
                return ['a.tex', 3]
        kind, received, error = host.call(Node(), 'VPxNode::getFilesToArchive')
        assert kind == 'pending' and received == ['a.tex']
        assert type(error) is TypeError
        assert str(error) == 'Expected a list of Strings or Unicode objects for argument 0'


class Data(vpx.VPxData):
    def __init__(self, label='abc', type_id=None):
        super().__init__()
        self.label, self.type_id, self.copied_from = label, type_id, None

    def name(self):
        return self.label

    def typeId(self):
        return self.type_id

    def copy(self, source):
        self.copied_from = source


class TestDataResults:
    def test_string(self):
        assert host.call(Data('abc'), 'VPxData::name') == 'abc'
        assert host.call(Data('héllo 𝄞'), 'VPxData::name') == 'héllo 𝄞'

    def test_string_of_the_wrong_kind_is_empty_with_a_type_error(self):
        kind, received, error = host.call(Data(None), 'VPxData::name')
        assert (kind, received, type(error)) == ('pending', '', TypeError)
        assert str(error) == 'Invalid Python object, expected a String or Unicode object'

    def test_type_id(self):
        assert host.call(Data(type_id=ov.VTypeId(0x70001)), 'VPxData::typeId') == 0x70001
        for wrong in (None, 12):
            kind, what, error = host.call(Data(type_id=wrong), 'VPxData::typeId')
            assert what == ('exception',
                            "SWIG director type mismatch in output value of type 'VTypeId'")
            assert type(error) is TypeError and str(error) == what[1]

    def test_a_director_argument_arrives_as_its_own_instance(self):
        target, source = Data(), Data('source')
        assert host.call(target, 'VPxData::copy', source) is None
        assert target.copied_from is source


class TestArity:
    """internalArrayCount exists with and without a context."""

    def counts(self, node):
        return (host.call(node, 'VPxNode::internalArrayCount', ov.VPlug()),
                host.call(node, 'VPxNode::internalArrayCount', ov.VPlug(), ov.VDGContext()))

    def test_short_form_override_gets_only_the_short_form(self):
        class Node(vpx.VPxNode):
            def internalArrayCount(self, plug):
                return 3
        assert self.counts(Node()) == (3, -1)    # -1: the host's own implementation

    def test_long_form_override_gets_only_the_long_form(self):
        class Node(vpx.VPxNode):
            def internalArrayCount(self, plug, context):
                return 4
        assert self.counts(Node()) == (-1, 4)

    def test_a_default_accepts_both(self):
        class Node(vpx.VPxNode):
            def internalArrayCount(self, plug, context=None):
                return 2 if context is None else 5
        assert self.counts(Node()) == (2, 5)

    def test_star_args_receives_every_overload(self):
        class Node(vpx.VPxNode):
            def internalArrayCount(self, *args):
                return len(args)
        assert self.counts(Node()) == (1, 2)


def test_a_method_replaced_on_the_class_changes_the_next_call():
    class Node(vpx.VPxNode):
        def compute(self, plug, block):
            return None
    node = Node()
    assert compute(node) == SUCCESS
    Node.compute = lambda self, plug, block: 'unknown'
    assert compute(node) == UNKNOWN
    del Node.compute
    assert compute(node) == UNKNOWN     # the host's own, through the proxy class


def test_the_lock_is_held_inside_an_override_and_released_after():
    seen = []

    class Node(vpx.VPxNode):
        def compute(self, plug, block):
            seen.append(m.getLockCaptureCount())
    node = Node()
    compute(node)
    assert seen[0] >= 1 and m.getLockCaptureCount() == 0
