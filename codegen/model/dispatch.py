"""How an overload dispatcher tells its candidates apart."""
from __future__ import annotations

from .records import Arg, Candidate, DispatchRule
from .naming import GeneratorError

# Argument kinds a dispatcher can test without converting for real.
TESTABLE = frozenset({'scalar', 'object', 'string', 'string_array', 'string_ptr', 'chars',
                      'callable'})


def dispatch_rules(cands: list[Candidate]) -> list[DispatchRule]:
    """Groups argument counts by the candidates that accept them; where several
    accept one count, each but the last is tested on the first argument in
    which it differs from the candidates after it, and the last is taken
    without a test."""
    lo = min(c.min_args for c in cands)
    hi = max(c.max_args for c in cands)
    rules: list[DispatchRule] = []
    for argc in range(lo, hi + 1):
        group = [c for c in cands if c.min_args <= argc <= c.max_args]
        if not group:
            continue
        if rules and rules[-1].candidates == group and rules[-1].counts[1] == argc - 1:
            rules[-1].counts = (rules[-1].counts[0], argc)
        else:
            rules.append(DispatchRule((argc, argc), group))
    for rule in rules:
        # A candidate whose only difference is an argument any object passes
        # (a bool) would take every call: it is tried last, without a test.
        others = [c for c in rule.candidates]
        rule.candidates = sorted(
            others, key=lambda c: not _discriminates_or_none(_first_difference(c, others)))
        for i, c in enumerate(rule.candidates):
            if i == len(rule.candidates) - 1:
                rule.tests.append(None)
                continue
            test = _first_difference(c, rule.candidates[i + 1:])
            if test is None:
                raise GeneratorError(f'{c.prototype}: no argument tells it apart')
            rule.tests.append(test)
    return rules


def _discriminates_or_none(a: Arg | None) -> bool:
    return a is None or _discriminates(a)


def _python_args(c: Candidate) -> list[Arg]:
    return sorted((a for a in c.args if a.slot is not None), key=lambda a: a.slot)


def _discriminates(a: Arg) -> bool:
    # The bool routine takes any object by its truth value: its check never fails.
    return a.kind in TESTABLE and a.converter != 'AsBool'


def _first_difference(c: Candidate, others: list[Candidate]) -> Arg | None:
    """The first argument in which `c` differs from the others and whose check
    can fail; failing that, the first in which it differs at all."""
    mine = _python_args(c)
    theirs = [_python_args(o) for o in others]
    differing = [a for k, a in enumerate(mine)
                 if not a.is_self and any(len(t) <= k or t[k].spelling != a.spelling
                                          for t in theirs)]
    for a in differing:
        if _discriminates(a):
            return a
    return differing[0] if differing and differing[0].kind in TESTABLE else None
