"""Every entry point of the converted classes, called with wrong arguments,
either raises or returns a result with no error left pending. The one
exception is a string argument that failed to convert while the host call
went on and succeeded: that call returns its result with the TypeError
still set, and the interpreter says so."""
import pytest

import vorlatesthost as host
from openvorla import OpenVorla as ov, OpenVorlaVPx as vpx, _OpenVorlaVPx as m

PREFIXES = ('VPxNode', 'VPxCommand', 'VPxData', 'VPxTransformationMatrix', 'VFnPlugin', 'charPtr',
            'intPtr', 'shortPtr', 'floatPtr', 'doublePtr', 'boolPtr', 'uIntPtr', 'uCharPtr')
# Registration takes any object; it has no wrong argument to try.
SKIP = ('_swigregister',)


def entry_points():
    for name, fn in vars(m).items():
        if type(fn).__name__ != 'builtin_function_or_method' or name.endswith(SKIP):
            continue
        cls = name.split('_')[1] if name.split('_')[0] in ('new', 'delete', 'disown') \
            else name.split('_')[0]
        if cls in PREFIXES:
            yield name, cls


def instance(cls):
    if cls == 'VFnPlugin':
        return vpx.VFnPlugin(host.load_plugin('walk', '/walk.py'))
    if cls == 'VPxData':
        return None
    return getattr(vpx, cls)()


WRONG = [(), (None,), (7,), ('text',), (7,) * 10, (2 ** 40, 2 ** 40), ([1, 2],)]


@pytest.mark.parametrize('name, cls', sorted(entry_points()))
def test_wrong_arguments_never_leave_an_error_behind_a_result(name, cls):
    fn = getattr(m, name)
    right = instance(cls)
    calls = list(WRONG) + [(right,) + tail for tail in
                           [(), (None,), (7,), ('x', 'y'), (None,) * 3, (ov.VObject(),) * 4, ([7],)]]
    for args in calls:
        try:
            fn(*args)
        except SystemError as e:
            # Only the documented string case may return with an error set.
            assert 'returned a result with an exception set' in str(e), (name, args)
            cause = e.__cause__
            assert isinstance(cause, TypeError) and str(cause).startswith(
                ('Expected a String or Unicode object for argument ',
                 'Expected a list of Strings or Unicode objects for argument ')), (name, args)
        except (TypeError, ValueError, OverflowError, RuntimeError, AttributeError):
            pass
    host.unload_all_plugins()
