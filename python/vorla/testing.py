"""Helpers for tests of plug-ins, run by a plain Python process (pytest):

    import vorla
    from vorla import testing

    def test_sine_node():
        with testing.loaded('plugins/sine_node.py'):
            node = vorla.create_node('sineNode')
            vorla.set_attr(node + '.input', 0.5)
            assert vorla.get_attr(node + '.output') == math.sin(0.5)

The application runs in the test's own process, as the vorla program runs
it: plug-ins are imported the same way, nodes compute on the same host
threads, failures raise the same RuntimeError texts and are logged the same.
"""
import contextlib

import vorla


@contextlib.contextmanager
def loaded(*files):
    """Loads the plug-in files, in order, into an application that starts
    from nothing, and gives their names. Afterwards the application is reset
    (the plug-ins unloaded, their nodes and kept commands deleted), also when
    a load fails or the test raises."""
    vorla.reset()
    try:
        yield [vorla.load_plugin(file) for file in files]
    finally:
        vorla.reset()


@contextlib.contextmanager
def new_log():
    """Gives a list that, when the block ends, holds the log entries written
    during it."""
    start = len(vorla.log())
    entries: list[str] = []
    try:
        yield entries
    finally:
        entries.extend(vorla.log()[start:])
