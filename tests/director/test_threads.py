"""Host threads calling Python overrides: no deadlock, every result right,
no reference left behind. Run in a child process with a time limit, so a
deadlock fails the test instead of hanging the run."""
import os
import subprocess
import sys
import textwrap

HERE = os.path.dirname(__file__)

CHILD = textwrap.dedent('''
    import sys
    from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m
    import vorlatesthost as host

    class Node(vpx.VPxNode):
        def __init__(self):
            super().__init__()
            self.calls = 0

        def compute(self, plug, block):
            self.calls += 1
            assert m.getLockCaptureCount() >= 1
            return 'unknown' if self.calls % 2 else None

    node = Node()
    plug, block = ov.VPlug(), ov.VDataBlock()
    before = sys.getrefcount(node)
    counts = host.call_threads(node, 'VPxNode::compute', 8, 10000, plug, block)
    assert counts == {5: 40000, 0: 40000}, counts
    assert node.calls == 80000, node.calls
    assert sys.getrefcount(node) == before, (sys.getrefcount(node), before)
    assert m.getLockCaptureCount() == 0
    print('ok')
''')


def test_eight_host_threads_ten_thousand_calls_each():
    env = dict(os.environ, PYTHONPATH=os.pathsep.join(sys.path))
    done = subprocess.run([sys.executable, '-c', CHILD], env=env, capture_output=True, text=True,
                          timeout=300)
    assert done.returncode == 0 and done.stdout.strip() == 'ok', done.stderr

