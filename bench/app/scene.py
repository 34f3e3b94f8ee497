"""The application benchmark's scene, run by vorla with bench_nodes.py loaded:
prints one line per measurement, "name value" (seconds, or a ratio)."""
import os
import sys
import time

import vorla

PLUGIN = os.path.join(os.path.dirname(os.path.abspath(__file__)), 'bench_nodes.py')
QUICK = '--quick' in sys.argv


def timed(action):
    start = time.perf_counter()
    action()
    return time.perf_counter() - start


def clear():
    vorla.unload_plugin('bench_nodes')
    vorla.load_plugin(PLUGIN)


def report(name, value):
    print(f'{name} {value:.6f}', flush=True)


# Nodes created with made-up names.
for n in (10 ** 3, 10 ** 4) if QUICK else (10 ** 3, 10 ** 4, 10 ** 5):
    report(f'create {n}', timed(lambda: [vorla.create_node('benchStep') for _ in range(n)]))
    clear()

# A value set at the head of a chain and read at its end, the chain dirty.
for n in (10 ** 2, 10 ** 3) if QUICK else (10 ** 2, 10 ** 3, 10 ** 4, 10 ** 5):
    names = [vorla.create_node('benchStep') for _ in range(n)]
    for a, b in zip(names, names[1:]):
        vorla.connect(a + '.output', b + '.input')

    def through():
        vorla.set_attr(names[0] + '.input', 1.0)
        assert vorla.get_attr(names[-1] + '.output') == n + 1.0
    through()
    report(f'chain {n}', timed(through))
    clear()

# Unloading a plug-in whose type has many nodes.
n = 10 ** 3 if QUICK else 10 ** 4
for _ in range(n):
    vorla.create_node('benchStep')
report(f'unload {n}', timed(lambda: vorla.unload_plugin('bench_nodes')))
vorla.load_plugin(PLUGIN)

# Independent nodes evaluated on host threads.
for kind, n in (('benchStep', 10 ** 3 if QUICK else 10 ** 4), ('benchHash', 64)):
    names = [vorla.create_node(kind) for _ in range(n)]
    for threads in (1, 2, 4, 8):
        times = []
        for round_ in range(5):   # the fastest of five, each on freshly dirty nodes
            for i, name in enumerate(names):
                vorla.set_attr(name + '.input', float(i + threads + round_))
            times.append(timed(lambda: vorla.evaluate(threads=threads)))
        report(f'evaluate {kind} {n} on {threads}', min(times))
    clear()
