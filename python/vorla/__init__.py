"""The application's scripting interface: plug-ins, nodes, commands, files.

The vorla program's scripts import it; so may any Python process (a test,
say), which then runs the application in itself: the same plug-in loader,
graph and command engine as the program. The application is reset (its
plug-ins unloaded) when the process exits. vorla.testing has helpers for
tests of plug-ins.
"""
import atexit as _atexit
import logging as _logging
import sys as _sys

from vorla._host import *  # noqa: F401,F403  (the application's functions)
from vorla import _host


class LogHandler(_logging.Handler):
    """Writes logging records to the application's log (stderr, and log()),
    as "Level: logger: message". The vorla program puts one on the root
    logger, at level INFO."""

    def emit(self, record):
        try:
            _host.write_log(f'{record.levelname.capitalize()}: {record.name}: '
                            f'{self.format(record)}')
        except Exception:
            self.handleError(record)


def _start_program():
    """What the vorla program sets up before it loads plug-ins: output that
    reaches the terminal line by line, in the order it was written, and the
    logging module writing to the application's log."""
    for stream in (_sys.stdout, _sys.stderr):
        stream.reconfigure(line_buffering=True)  # type: ignore[attr-defined]
    root = _logging.getLogger()
    root.addHandler(LogHandler())
    root.setLevel(_logging.INFO)


def _interact():
    """The program's interactive prompt, as Python's own, with vorla imported."""
    import code
    import __main__
    if _sys.stdin.isatty():
        try:
            import readline  # noqa: F401  (line editing and history)
        except ImportError:
            pass
    __main__.__dict__.setdefault('vorla', _sys.modules[__name__])
    code.interact(banner=f'vorla, Python {_sys.version.split()[0]}; plug-ins: '
                         f'{", ".join(_host.plugins()) or "none"}',
                  local=__main__.__dict__, exitmsg='')


_atexit.register(_host.reset)
