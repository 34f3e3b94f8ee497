"""The scripting engine's message resources the module declares: made once,
when the library loads."""
import os
import subprocess
import sys
import textwrap


def test_the_module_makes_its_three_message_resources_once():
    child = textwrap.dedent('''
        import vorlatesthost as host
        before = host.string_ids()
        from openvorla import OpenVorlaVPx
        import importlib
        importlib.reload(OpenVorlaVPx)      # the extension itself is not loaded again
        print(before, host.string_ids())
    ''')
    env = dict(os.environ, PYTHONPATH=os.pathsep.join(sys.path))
    done = subprocess.run([sys.executable, '-c', child], env=env, capture_output=True, text=True,
                          timeout=60)
    assert done.returncode == 0, done.stderr
    assert done.stdout.split() == ['(0,', '0)', '(3,', '0)']
