"""Every built-in function of both extension modules, walked with hostile
arguments in child processes (walk.py): no signal, no hang, no exception of a
class the module does not raise, and a result with an error set only for the
string arguments whose conversion lets the call go on."""
import os
import subprocess
import sys

HERE = os.path.dirname(os.path.abspath(__file__))
SHARDS = 2


def test_the_hostile_walk_ends_cleanly_in_every_shard():
    env = dict(os.environ, PYTHONPATH=os.pathsep.join(sys.path))
    children = [subprocess.Popen([sys.executable, os.path.join(HERE, 'walk.py'), str(k),
                                  str(SHARDS)], env=env, cwd=HERE, stdout=subprocess.PIPE,
                                 stderr=subprocess.PIPE, text=True)
                for k in range(SHARDS)]
    for child in children:
        try:
            out, err = child.communicate(timeout=1200)
        except subprocess.TimeoutExpired:
            child.kill()
            out, err = child.communicate()
            raise AssertionError(f'hung after {out.splitlines()[-1:]}')
        lines = out.splitlines()
        # The stderr tail carries a sanitizer's report, if any.
        report = '\n'.join(err.splitlines()[-40:])
        assert child.returncode == 0, f'status {child.returncode} after {lines[-1:]}\n{report}'
        assert lines[-1].startswith('done'), lines[-3:]
        problems = [line for line in lines if line.startswith('PROBLEM')]
        assert not problems, '\n'.join(problems[:50])
