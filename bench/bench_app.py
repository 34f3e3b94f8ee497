"""The application part of `make bench`: vorla running bench/app/scene.py with
the node types of bench/app/bench_nodes.py, each measurement printed as a
table with the targets it is held to.

    python3 bench/bench_app.py [--build DIR] [--quick]
"""
import argparse
import os
import subprocess
import sys

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
APP = os.path.join(ROOT, 'bench', 'app')


def measure(build, quick):
    command = [os.path.join(build, 'bin', 'vorla'), '--plugin',
               os.path.join(APP, 'bench_nodes.py'), os.path.join(APP, 'scene.py')]
    if quick:
        command.append('--quick')
    done = subprocess.run(command, capture_output=True, text=True, check=True)
    out = {}
    for line in done.stdout.splitlines():
        name, value = line.rsplit(' ', 1)
        out[name] = float(value)
    return out


def main():
    ap = argparse.ArgumentParser()
    ap.add_argument('--build', default=os.path.join(ROOT, 'build'))
    ap.add_argument('--quick', action='store_true')
    args = ap.parse_args()
    m = measure(os.path.abspath(args.build), args.quick)
    print('\nThe application (vorla, one process, 2 cores): seconds')
    for name, value in m.items():
        print(f'  {name:<34} {value:10.4f}')
    checks = []
    if 'create 100000' in m:
        checks.append(('10^5 nodes created in under 2 s', m['create 100000'] < 2.0,
                       f"{m['create 100000']:.2f} s"))
    big = 'chain 100000' if 'chain 100000' in m else 'chain 1000'
    ratio = m[big] / m['chain 1000'] if big != 'chain 1000' else m['chain 1000'] / m['chain 100']
    limit = 150 if big == 'chain 100000' else 15
    checks.append((f'{big} / the 10x or 100x smaller chain under {limit}', ratio < limit,
                   f'{ratio:.0f}'))
    unload = [k for k in m if k.startswith('unload')][0]
    checks.append((f'{unload} nodes unloaded in under 0.5 s', m[unload] < 0.5, f'{m[unload]:.3f} s'))
    for kind in ('benchStep', 'benchHash'):
        one = [v for k, v in m.items() if k.startswith(f'evaluate {kind}') and k.endswith(' on 1')][0]
        eight = [v for k, v in m.items() if k.startswith(f'evaluate {kind}') and k.endswith(' on 8')][0]
        checks.append((f'{kind}: 8 threads not slower than 1 (within 10%)', eight <= one * 1.10,
                       f'{eight / one:.2f}x'))
    print()
    for text, ok, value in checks:
        print(f"  {'met' if ok else 'NOT MET'}: {text} ({value})")
    return 0


if __name__ == '__main__':
    sys.exit(main())
