"""Runs the application as a user does: `vorla [--plugin FILE]... SCRIPT`, in a
child process with a time limit, so that a deadlock fails a test instead of
hanging the run."""
import os
import subprocess
import textwrap

ROOT = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
BUILD = os.path.join(ROOT, os.environ.get('OPENVORLA_BUILD', 'build'))
VORLA = os.path.join(BUILD, 'bin', 'vorla')
EXAMPLES = os.path.join(ROOT, 'examples', 'plugins')


def example(name):
    return os.path.join(EXAMPLES, name)


class Vorla:
    def __init__(self, tmp_path):
        self.tmp_path = tmp_path

    def file(self, name, text):
        path = self.tmp_path / name
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_text(textwrap.dedent(text))
        return str(path)

    def run(self, *args, script=None, env=None, timeout=120, stdin='', merged=False):
        """vorla with the arguments, and a script given as text last; stdin
        holds `stdin`. merged: stderr goes where stdout does."""
        command = [VORLA, *args]
        if script is not None:
            command.append(self.file('script.py', script))
        return subprocess.run(command, stdout=subprocess.PIPE,
                              stderr=subprocess.STDOUT if merged else subprocess.PIPE,
                              input=textwrap.dedent(stdin), text=True, timeout=timeout,
                              env=env, cwd=self.tmp_path)

    def ok(self, *args, **kwargs):
        """Runs it and expects exit status 0; the output's lines."""
        done = self.run(*args, **kwargs)
        assert done.returncode == 0, done.stdout + done.stderr
        return done.stdout.splitlines()
