"""The application at scale, as a user drives it: long chains pulled without
nesting a compute per node, names made up in constant time, changes that stop
where values are dirty already, and unloading with connections. (Times are
the benchmark's, bench/bench_app.py; these check the results.)"""

PLUGIN = '''
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx

class Step(vpx.VPxNode):
    input = output = skipped = None
    def compute(self, plug, data):
        if plug.attribute() != Step.output:
            return 'unknown'
        out = data.outputValue(Step.output)
        out.setDouble(data.inputValue(Step.input).asDouble() + 1.0)
        out.setClean()

def initialize():
    numeric = ov.VFnNumericAttribute()
    Step.input = numeric.create('input', 'in', ov.VFnNumericData.kDouble, 0.0)
    Step.skipped = numeric.create('skipped', 'sk', ov.VFnNumericData.kDouble, 0.0)
    Step.output = numeric.create('output', 'out', ov.VFnNumericData.kDouble, 0.0)
    numeric.setWritable(False)
    for a in (Step.input, Step.skipped, Step.output):
        vpx.VPxNode.addAttribute(a)
    vpx.VPxNode.attributeAffects(Step.input, Step.output)
    vpx.VPxNode.attributeAffects(Step.skipped, Step.output)

def initializePlugin(obj):
    vpx.VFnPlugin(obj).registerNode('step', ov.VTypeId(0x7A950), Step, initialize)

def uninitializePlugin(obj):
    vpx.VFnPlugin(obj).deregisterNode(ov.VTypeId(0x7A950))
'''


def test_a_chain_of_a_hundred_thousand_nodes_is_pulled_from_its_end(vorla):
    lines = vorla.ok('--plugin', vorla.file('step.py', PLUGIN), script='''
        import vorla
        n = 100000
        names = [vorla.create_node('step') for _ in range(n)]
        for a, b in zip(names, names[1:]):
            vorla.connect(a + '.output', b + '.input')
        vorla.set_attr(names[0] + '.input', 1.0)
        print(vorla.get_attr(names[-1] + '.output'))
        counts = {c for _, _, c in vorla.nodes()}
        vorla.set_attr(names[0] + '.input', 2.0)
        vorla.set_attr(names[0] + '.input', 3.0)    # the chain is dirty already
        print(vorla.get_attr(names[-1] + '.output'), counts)
        print({c for _, _, c in vorla.nodes()})
    ''', timeout=300)
    # Each node computed once per pull, and the second change reached the end.
    assert lines == ['100001.0', '100003.0 {1}', '{2}']


def test_made_up_names_go_on_after_deletions_and_stay_unique(vorla):
    lines = vorla.ok('--plugin', vorla.file('step.py', PLUGIN), script='''
        import vorla
        made = [vorla.create_node('step') for _ in range(3)]
        vorla.delete_node('step2')
        made += [vorla.create_node('step'), vorla.create_node('step', 'step6')]
        made.append(vorla.create_node('step'))
        print(made, [n for n, _, _ in vorla.nodes()])
    ''')
    assert lines == ["['step1', 'step2', 'step3', 'step4', 'step6', 'step5'] "
                     "['step1', 'step3', 'step4', 'step6', 'step5']"]


def test_a_compute_that_skips_an_input_still_sees_its_later_changes(vorla):
    # 'skipped' affects the output, which never reads it: pulling the output
    # brings the input up to date first, so that a later change of its source
    # still reaches the output.
    lines = vorla.ok('--plugin', vorla.file('step.py', PLUGIN), script='''
        import vorla
        a, b = vorla.create_node('step'), vorla.create_node('step')
        vorla.connect(a + '.output', b + '.skipped')
        print(vorla.get_attr(b + '.output'))
        vorla.set_attr(b + '.input', 5.0)
        vorla.set_attr(a + '.input', 1.0)
        print(vorla.get_attr(b + '.output'), [c for _, _, c in vorla.nodes()])
    ''')
    assert lines == ['1.0', "6.0 [2, 2]"]


def test_unloading_takes_the_nodes_and_their_connections(vorla):
    other = PLUGIN.replace("'step'", "'other'").replace('0x7A950', '0x7A951')
    lines = vorla.ok('--plugin', vorla.file('step.py', PLUGIN), '--plugin',
                     vorla.file('other.py', other), script='''
        import vorla
        steps = [vorla.create_node('step') for _ in range(2000)]
        last = vorla.create_node('other')
        for a, b in zip(steps, steps[1:]):
            vorla.connect(a + '.output', b + '.input')
        vorla.connect(steps[-1] + '.output', last + '.input')
        vorla.set_attr(steps[0] + '.input', 1.0)
        print(vorla.get_attr(last + '.output'))
        vorla.unload_plugin('step')
        # The survivor keeps the value it last took, and takes input again.
        print(vorla.nodes(), vorla.get_attr(last + '.output'))
        vorla.set_attr(last + '.input', 10.0)
        print(vorla.get_attr(last + '.output'))
    ''')
    assert lines == ['2002.0', "[('other1', 'other', 1)] 2002.0", '11.0']
