"""Prints what the built package holds: a quick look at the module before the
application exists to load plug-ins with it."""
import os
import sys

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))
sys.path.insert(0, os.path.join(ROOT, os.environ.get('OPENVORLA_BUILD', 'build'), 'python'))

from openvorla import OpenVorla, OpenVorlaVPx, _OpenVorlaVPx as ext  # noqa: E402


def main():
    builtins = [v for v in vars(ext).values() if type(v).__name__ == 'builtin_function_or_method']
    ints = {k: v for k, v in vars(ext).items() if type(v) is int}
    classes = [v for v in vars(OpenVorlaVPx).values()
               if isinstance(v, type) and v.__module__ == OpenVorlaVPx.__name__]
    print(f'{ext.__name__} from {os.path.relpath(ext.__file__, ROOT)}')
    print(f'  plug-in maker (PLUGIN_COMPANY): {ext.PLUGIN_COMPANY}')
    print(f'  built-in functions:             {len(builtins)}')
    print(f'  integer constants:              {len(ints)}'
          f' (VPxNode_kLast = {ext.VPxNode_kLast}, VPxRenderPassImpl_kOther = {ext.VPxRenderPassImpl_kOther})')
    print(f'  global variable link:           {ext.cvar!r}')
    print(f'  proxy classes:                  {len(classes)}')
    directors = sorted(c.__name__ for c in classes if hasattr(c, '__disown__'))
    plain = sorted(c.__name__ for c in classes if not hasattr(c, '__disown__'))
    print(f'    that Python may subclass:     {len(directors)}')
    print(f'    plain classes:                {", ".join(plain)}')
    node = OpenVorlaVPx.VPxNode()
    print(f'  a node made from Python:        {node!r}')
    print(f'    owned by Python:              {node.thisown}')
    derived = OpenVorlaVPx.VPxDeformerNode()
    print(f'  a deformer node, class chain:   '
          f'{" -> ".join(c.__name__ for c in type(derived).__mro__[:-1])}')
    obj = OpenVorla.VObject()
    print(f'  a value from the sibling:       {obj!r}')
    try:
        OpenVorlaVPx.VPxData()
    except RuntimeError as e:
        print(f'  an abstract class refuses:      VPxData() -> RuntimeError: {e}')


if __name__ == '__main__':
    main()
