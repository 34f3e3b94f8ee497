"""Cost of one call through the generated entry points of _OpenVorlaVPx.

Each row is one calling form of a generated entry point, timed side by side
with the same host call made through
  floor    a hand-written C API function doing the same work (bench_floor),
  pybind11 the same host call bound with pybind11 (bench_pybind),
  proxy    the generated Python class's method,
  def      a Python method with explicit arguments forwarding to the built-in,
  builtin  the built-in made a method with SWIG_PyInstanceMethod_New
           (SWIG_PyStaticMethod_New for the static row).
pybind11's methods are called through their class, VPxNode.isAbstractClass(p),
which is the calling form of the generated entry points.

Times are raw nanoseconds per call (loop included, nothing subtracted), the
median of many short rounds. In each round a row's variants run back to back,
in an order that rotates from round to round, and the row's ratios are taken
there, so that the machine's drift touches the compared variants alike.

A second table times the other direction: the host calling a virtual
operation whose override is a Python method, through
  generated the director that _OpenVorlaVPx makes for a Python subclass,
  floor     a hand-written C++ subclass forwarding the call the same way
            (bench_overrides), to an instance of the same Python class,
  pybind11  a pybind11 trampoline, overridden by a Python subclass of the
            pybind11 class with the same method (bench_pybind).
The host's loop of calls runs and is timed in C++ (the same loop for every
variant); in-lock rows are called from Python's thread, so the overrides'
interpreter lock is re-entered; the host-thread row calls from a new thread
that does not hold it, while Python's thread waits without it.

Run by `make bench`; `--build DIR` names the build tree.
"""
import argparse
import os
import platform
import statistics
import sys
import timeit

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))

FLOOR_LIMIT = 1.10      # generated / floor, at most
PYBIND_SPEEDUP = 2.5    # pybind11 / generated, at least
# A method called through a proxy instance, against the flat entry point.
PROXY_LIMIT = 1.15

VARIANTS = ('generated', 'floor', 'pybind', 'proxy', 'def', 'builtin')
OVERRIDE_VARIANTS = ('generated', 'floor', 'pybind')
# A call from a thread unknown to Python costs tens of in-lock calls (the
# lock makes and drops the thread's interpreter state every time), so that
# row's samples make this many times fewer calls, to stay as short.
THREAD_DIVISOR = 10


_ext = None  # openvorla._OpenVorlaVPx, once the build tree is on the path


def forwarding_classes():
    """Two standalone classes forwarding to the built-ins, one way each; the
    forwarders read the module as a global, as a module's own classes do."""

    class DefForwarders:
        def __init__(self, this):
            self.this = this

        @staticmethod
        def registeringCallableScript():
            return _ext.VFnPlugin_registeringCallableScript()

        def isAbstractClass(self):
            return _ext.VPxNode_isAbstractClass(self)

        def getFilesToArchive(self, shortName=False, unresolvedName=False,
                              markCouldBeImageSequence=False):
            return _ext.VPxNode_getFilesToArchive(self, shortName, unresolvedName,
                                                  markCouldBeImageSequence)

        def copyInternalData(self, node):
            return _ext.VPxNode_copyInternalData(self, node)

        def setCommandString(self, command):
            return _ext.VPxCommand_setCommandString(self, command)

        def setVersion(self, version):
            return _ext.VFnPlugin_setVersion(self, version)

    class BuiltinForwarders:
        def __init__(self, this):
            self.this = this

        method = _ext.SWIG_PyInstanceMethod_New
        registeringCallableScript = _ext.SWIG_PyStaticMethod_New(
            _ext.VFnPlugin_registeringCallableScript)
        isAbstractClass = method(_ext.VPxNode_isAbstractClass)
        getFilesToArchive = method(_ext.VPxNode_getFilesToArchive)
        copyInternalData = method(_ext.VPxNode_copyInternalData)
        setCommandString = method(_ext.VPxCommand_setCommandString)
        setVersion = method(_ext.VFnPlugin_setVersion)
        del method

    return DefForwarders, BuiltinForwarders


def make_rows():
    """[(label, expected result, {variant: (statement, names)})], and the
    objects that check() needs."""
    global _ext
    from openvorla import OpenVorlaVPx as vpx, _OpenVorlaVPx as _ext
    import bench_floor as floor
    import bench_pybind as pb

    node, other, cmd = vpx.VPxNode(), vpx.VPxNode(), vpx.VPxCommand()
    floor.setup(node.this)
    plugin = vpx.VFnPlugin(floor.load_plugin('benchCalls'))
    p_node, p_other, p_cmd = pb.VPxNode(), pb.VPxNode(), pb.VPxCommand()
    p_plugin = pb.VFnPlugin('benchCalls')  # the same loaded plug-in
    Def, Builtin = forwarding_classes()

    def row(label, expected, method, generated, floor_fn, pybind_fn, args, host, p_host):
        """`method` called with `args` on `host`, a proxy; on the class for a
        static (host None). `a` names the other node in `args`."""
        static = host is None
        call = f'({", ".join(("s",) * (not static) + args)})'
        method_call = f'o.{method}({", ".join(args)})'
        names = dict(s=host, a=other)
        for_class = lambda cls: dict(names, o=cls if static else cls(host.this))
        return (label, expected, {
            'generated': ('f' + call, dict(names, f=generated)),
            'floor': ('f' + call, dict(names, f=floor_fn)),
            'pybind': ('f' + call, dict(s=p_host, a=p_other, f=pybind_fn)),
            'proxy': (method_call, dict(names, o=vpx.VFnPlugin if static else host)),
            'def': (method_call, for_class(Def)),
            'builtin': (method_call, for_class(Builtin)),
        })

    text = '"polyCube -w 2"'
    return [
        row('no argument', False, 'registeringCallableScript',
            _ext.VFnPlugin_registeringCallableScript, floor.registeringCallableScript,
            pb.registeringCallableScript, (), None, None),
        row('one object', False, 'isAbstractClass', _ext.VPxNode_isAbstractClass,
            floor.isAbstractClass, pb.VPxNode.isAbstractClass, (), node, p_node),
        row('tuple of scalars', [], 'getFilesToArchive', _ext.VPxNode_getFilesToArchive,
            floor.getFilesToArchive, pb.VPxNode.getFilesToArchive, ('False', 'True', 'False'),
            node, p_node),
        row('wrapped object', None, 'copyInternalData', _ext.VPxNode_copyInternalData,
            floor.copyInternalData, pb.VPxNode.copyInternalData, ('a',), node, p_node),
        row('string', None, 'setCommandString', _ext.VPxCommand_setCommandString,
            floor.setCommandString, pb.VPxCommand.setCommandString, (text,), cmd, p_cmd),
        row('status result', None, 'setVersion', _ext.VFnPlugin_setVersion, floor.setVersion,
            pb.VFnPlugin.setVersion, ('"1.2"',), plugin, p_plugin),
    ], (floor, node, cmd, plugin)


def timer(statement, names):
    # The names become locals of the timing function, as in real call sites.
    setup = '\n'.join(f'{k} = _names[{k!r}]' for k in names)
    return timeit.Timer(statement, setup, globals={'_names': names})


def check(rows, floor, node, cmd, plugin):
    """Every variant returns what the host call should, and the floor really
    checks its arguments' types; a wrong result would make its timing moot."""
    for label, expected, variants in rows:
        for variant, (statement, names) in variants.items():
            got = eval(statement, dict(names))
            if got != expected:
                sys.exit(f'{label}/{variant}: {statement} returned {got!r}, not {expected!r}')
    if cmd.commandString() != 'polyCube -w 2' or plugin.version() != '1.2':
        sys.exit('the host calls did not take effect')
    for call in (lambda: floor.isAbstractClass(cmd), lambda: floor.copyInternalData(node, cmd),
                 lambda: floor.setCommandString(cmd, 5), lambda: floor.setVersion(node, '1')):
        try:
            call()
        except TypeError:
            continue
        sys.exit('a floor function took an argument of the wrong type')


def override_rows():
    """[(label, {variant: (timing function, host object)}, calls divisor)],
    and the classes and objects that check_overrides() needs. A timing
    function takes the object and a number of calls, and returns ns per call."""
    from openvorla import OpenVorlaVPx as vpx
    import bench_overrides as ours
    import bench_pybind as pb

    def overriding(node_base, data_base):
        class Node(node_base):
            def compute(self, plug, block):
                return None

            def isAbstractClass(self):
                return True

        class Data(data_base):
            def name(self):
                return 'abc'

        return Node, Data

    Node, Data = overriding(vpx.VPxNode, vpx.VPxData)
    PbNode, PbData = overriding(pb.VPxNode, pb.VPxData)
    # The floor's forwarders hold instances of the generated variant's classes.
    hosts = {'generated': (ours, Node(), Data()),
             'floor': (ours, ours.floor_node(Node()), ours.floor_data(Data())),
             'pybind': (pb, PbNode(), PbData())}

    def row(label, function, data=False, divisor=1):
        return label, {v: (getattr(module, function), data_object if data else node)
                       for v, (module, node, data_object) in hosts.items()}, divisor

    rows = [row('status, 2 objects', 'compute'), row('bool', 'isAbstractClass'),
            row('string', 'name', data=True),
            row('status, host thread', 'compute_in_thread', divisor=THREAD_DIVISOR)]
    return rows, ((Node, PbNode), hosts)


def check_overrides(rows, node_classes, hosts):
    """Every variant's host call reaches the Python method, on every call, and
    converts its result as a forwarding override must; a variant that cached
    the method or took a shortcut would be timed doing less."""
    for variant, (module, node, data) in hosts.items():
        got = (module.compute_once(node), module.isAbstractClass_once(node), module.name_once(data))
        if got != (0, True, 'abc'):
            sys.exit(f'{variant}: compute, isAbstractClass, name gave {got}, not (0, True, \'abc\')')
    originals = [cls.compute for cls in node_classes]
    for cls in node_classes:
        cls.compute = lambda self, plug, block: 'unknown'  # the interned string: kUnknownParameter
    try:
        got = {v: module.compute_once(node) for v, (module, node, _) in hosts.items()}
    finally:
        for cls, compute in zip(node_classes, originals):
            cls.compute = compute
    if set(got.values()) != {5}:
        sys.exit(f'a replaced compute was not called, or its result not converted: {got}')
    for _, variants, _ in rows:
        for function, obj in variants.values():
            function(obj, 1)  # raises on a failed call or a wrong result


def measure_overrides(rows, number, rounds):
    """As measure(), on the C++ loops' own timings."""
    samples = {}
    for r in range(rounds):
        for i in range(len(rows)):
            label, variants, divisor = rows[(i + r) % len(rows)]
            order = OVERRIDE_VARIANTS[r % 3:] + OVERRIDE_VARIANTS[:r % 3]
            t = {v: variants[v][0](variants[v][1], max(1, number // divisor)) for v in order}
            for v in OVERRIDE_VARIANTS:
                samples.setdefault((label, v), []).append(t[v])
            for name, value in (('/floor', t['generated'] / t['floor']),
                                ('pybind/', t['pybind'] / t['generated']),
                                ('pybind/floor', t['pybind'] / t['floor'])):
                samples.setdefault((label, name), []).append(value)
    return {key: statistics.median(values) for key, values in samples.items()}


def goal(labels, m, text, key, fails, fmt):
    misses = [label for label in labels if fails(m[label, key])]
    values = ', '.join(f'{label} {fmt(m[label, key])}' for label in labels)
    print(f'{text}: {"not met on " + ", ".join(misses) if misses else "met"} ({values})')


def speed_goals(labels, m):
    goal(labels, m, f'generated within {FLOOR_LIMIT:.2f}x of the floor', '/floor',
         lambda r: r > FLOOR_LIMIT, lambda r: f'{r:.2f}x')
    goal(labels, m, f'at least {PYBIND_SPEEDUP}x faster than pybind11', 'pybind/',
         lambda r: r < PYBIND_SPEEDUP, lambda r: f'{r:.2f}x')
    # The bound that the conversions and the host call leave to any binding.
    print('  for reference, the floor against pybind11: '
          + ', '.join(f'{label} {m[label, "pybind/floor"]:.2f}x' for label in labels))


def report_overrides(rows, m, number, rounds):
    print(f'\nHost calls into Python overrides: {number} calls per sample ('
          f'{number // THREAD_DIVISOR} from a host thread), timed in C++, median of {rounds} '
          f'rounds; ns per call, loop included; ratios are medians of per-round ratios\n')
    head = ('row', 'generated', 'floor', 'ratio', 'pybind11', 'speedup')
    print(f'{head[0]:<22}' + ''.join(f'{h:>12}' for h in head[1:]))
    for label, _, _ in rows:
        t = {v: m[label, v] for v in OVERRIDE_VARIANTS}
        print(f'{label:<22}{t["generated"]:12.1f}{t["floor"]:12.1f}{m[label, "/floor"]:11.2f}x'
              f'{t["pybind"]:12.1f}{m[label, "pybind/"]:11.2f}x')
    print()
    speed_goals([label for label, _, _ in rows], m)


def measure(rows, number, rounds):
    """Median ns per call of every variant, and medians of the per-round
    ratios. The machine's speed drifts by up to half in phases of milliseconds
    to seconds; a row's variants, run a few milliseconds apart, share one."""
    empty = timer('pass', {})
    timers = [(label, {v: timer(*variants[v]) for v in VARIANTS}) for label, _, variants in rows]
    samples = {}
    for r in range(rounds):
        samples.setdefault(('empty', ''), []).append(empty.timeit(number) / number * 1e9)
        for i in range(len(timers)):
            label, row_timers = timers[(i + r) % len(timers)]
            order = VARIANTS[r % len(VARIANTS):] + VARIANTS[:r % len(VARIANTS)]
            t = {v: row_timers[v].timeit(number) / number * 1e9 for v in order}
            for v in VARIANTS:
                samples.setdefault((label, v), []).append(t[v])
            for name, value in (('/floor', t['generated'] / t['floor']),
                                ('pybind/', t['pybind'] / t['generated']),
                                ('pybind/floor', t['pybind'] / t['floor']),
                                ('proxy/', t['proxy'] / t['generated'])):
                samples.setdefault((label, name), []).append(value)
    return {key: statistics.median(values) for key, values in samples.items()}


def report(rows, m, number, rounds):
    print(f'Python {platform.python_version()}: {number} calls per sample, median of {rounds} '
          f'rounds; ns per call, loop included (empty loop {m["empty", ""]:.1f} ns); ratios are '
          f'medians of per-round ratios\n')
    head = ('row', 'generated', 'floor', 'ratio', 'pybind11', 'speedup', 'proxy', 'def fwd',
            'builtin fwd')
    print(f'{head[0]:<18}' + ''.join(f'{h:>12}' for h in head[1:]))
    for label, _, _ in rows:
        t = {v: m[label, v] for v in VARIANTS}
        print(f'{label:<18}{t["generated"]:12.1f}{t["floor"]:12.1f}{m[label, "/floor"]:11.2f}x'
              f'{t["pybind"]:12.1f}{m[label, "pybind/"]:11.2f}x{t["proxy"]:12.1f}{t["def"]:12.1f}'
              f'{t["builtin"]:12.1f}')

    labels = [label for label, _, _ in rows]
    print()
    speed_goals(labels, m)
    goal(labels, m, f'proxy method within {PROXY_LIMIT:.2f}x of the flat entry point', 'proxy/',
         lambda r: r > PROXY_LIMIT, lambda r: f'{r:.2f}x')


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    parser.add_argument('--build', default='build', help='build tree (default: build)')
    parser.add_argument('--number', type=int, default=50_000, help='calls per sample')
    parser.add_argument('--override-number', type=int, default=10_000,
                        help='host calls per sample of the override table')
    parser.add_argument('--rounds', type=int, default=41)
    args = parser.parse_args()
    sys.path.insert(0, os.path.join(ROOT, args.build, 'python'))
    rows, objects = make_rows()
    check(rows, *objects)
    host_rows, host_objects = override_rows()
    check_overrides(host_rows, *host_objects)
    report(rows, measure(rows, args.number, args.rounds), args.number, args.rounds)
    sys.stdout.flush()
    report_overrides(host_rows, measure_overrides(host_rows, args.override_number, args.rounds),
                     args.override_number, args.rounds)


if __name__ == '__main__':
    main()
