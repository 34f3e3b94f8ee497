"""What the value protocols of OpenVorla cost.

The first table times calls on values, each beside the plain method call that
does comparable work: an operator against a method returning a new value, a
subscript and a length against reading a data member, a repr and a hash
against a method call; then the sequences standing for arrays, from lists and
from numpy, against appending one element at a time. The second line is the
import time of openvorla.OpenVorla in a fresh interpreter.

Times are nanoseconds per call (loop included), the median of short rounds.
Run by `make bench`; `--build DIR` names the build tree.
"""
import argparse
import os
import statistics
import subprocess
import sys
import timeit

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
ROUNDS = 15

SETUP = '''
import numpy as np
from openvorla import OpenVorla as ov
p, q, v = ov.VPoint(1, 2, 3), ov.VPoint(4, 5, 6), ov.VVector(1, 0, 0)
m = ov.VMatrix()
tid = ov.VTypeId(0x7A200)
rows = [[float(i), 0.0, 1.0] for i in range(1000)]
xyz = np.array(rows)
points = ov.VPointArray(rows)
add = ov.VPoint.__add__
def appended():
    a = ov.VPointArray()
    for r in rows:
        a.append(ov.VPoint(r[0], r[1], r[2]))
    return a
'''

# (label, statement, the plain call it is compared with)
ROWS = [
    ('p + v', 'p + v', 'p.asVector()'),
    ('VPoint.__add__(p, v)', 'add(p, v)', 'p.asVector()'),
    ('p * m', 'p * m', 'p.asVector()'),
    ('p[1]', 'p[1]', 'p.y'),
    ('len(p)', 'len(p)', 'p.y'),
    ('p == q', 'p == q', 'p.isEquivalent(q)'),
    ('p.distanceTo([4, 5, 6])', 'p.distanceTo([4, 5, 6])', 'p.distanceTo(q)'),
    ('hash(VTypeId)', 'hash(tid)', 'tid.id()'),
    ('repr(p)', 'repr(p)', 'p.asVector()'),
    ('VPointArray(1000 lists)', 'ov.VPointArray(rows)', 'appended()'),
    ('VPointArray(numpy 1000x3)', 'ov.VPointArray(xyz)', 'appended()'),
    ('np.array(VPointArray 1000)', 'np.array(points)', 'appended()'),
]


def per_call(statement, number):
    t = timeit.Timer(statement, SETUP)
    return statistics.median(t.timeit(number) / number * 1e9 for _ in range(ROUNDS))


def import_time(python_dir):
    code = ('import time; t = time.perf_counter(); import openvorla.OpenVorla; '
            'print(time.perf_counter() - t)')
    env = dict(os.environ, PYTHONPATH=python_dir)
    runs = [float(subprocess.run([sys.executable, '-c', code], env=env, capture_output=True,
                                 text=True, check=True).stdout) for _ in range(ROUNDS)]
    return statistics.median(runs) * 1e3


def main():
    ap = argparse.ArgumentParser()
    ap.add_argument('--build', default='build')
    args = ap.parse_args()
    python_dir = os.path.join(ROOT, args.build, 'python')
    sys.path.insert(0, python_dir)
    print(f'{"call":<28} {"ns":>10} {"plain call":<20} {"ns":>10} {"ratio":>6}')
    for label, statement, plain in ROWS:
        number = 200 if 'VPointArray' in label or 'np.array' in label else 100000
        ns, base = per_call(statement, number), per_call(plain, number)
        print(f'{label:<28} {ns:>10.0f} {plain:<20} {base:>10.0f} {ns / base:>6.2f}')
    print(f'\nimport openvorla.OpenVorla: {import_time(python_dir):.1f} ms')


if __name__ == '__main__':
    main()
