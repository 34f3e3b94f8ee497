"""Evaluation on the host's threads: 1,000 sine nodes in chains, computed by
8 threads that take the interpreter lock for each compute, give the values
that one thread gives, each node computed once."""
from app_runner import example

SCRIPT = '''
import math
import vorla

COUNT, CHAIN = 1000, 10
nodes = [vorla.create_node('sineNode') for _ in range(COUNT)]
for i, node in enumerate(nodes):
    if i % CHAIN:
        vorla.connect(nodes[i - 1] + '.output', node + '.input')
    else:
        vorla.set_attr(node + '.input', i / COUNT)
    vorla.set_attr(node + '.amplitude', 1 + i % 7 / 10)


def evaluate(threads=None):
    vorla.evaluate(threads)
    used = vorla.evaluation_threads()
    computes = [c for _, _, c in vorla.nodes()]
    values = [vorla.get_attr(node + '.output') for node in nodes]
    # Everything was computed: reading computes nothing more.
    assert [c for _, _, c in vorla.nodes()] == computes
    return used, set(computes), values


one = evaluate(1)
for head in nodes[::CHAIN]:   # dirties every chain from its head down
    vorla.set_attr(head + '.amplitude', vorla.get_attr(head + '.amplitude'))
eight = evaluate()   # as many as --threads says
print(one[0], one[1], eight[1])
print(sorted(eight[0]) == list(range(len(eight[0]))), 1 < len(eight[0]) <= 8)
expected, x = [], 0.0
for i in range(COUNT):
    x = (1 + i % 7 / 10) * math.sin(i / COUNT if i % CHAIN == 0 else x)
    expected.append(x)
print(eight[2] == one[2], one[2] == expected)
'''


def test_eight_threads_over_a_thousand_nodes_match_one_thread(vorla):
    lines = vorla.ok('--threads', '8', '--plugin', example('sine_node.py'), script=SCRIPT,
                     timeout=300)
    assert lines == ['[0] {1} {2}', 'True True', 'True True']
