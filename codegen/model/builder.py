"""Builds the model of a module from its manifest and its parsed headers."""
from __future__ import annotations

import codecs
import keyword

from ..manifest import Manifest
from ..parse import Class, CType, Function, Headers, Param, Variable
from . import conversions, protocols
from .dispatch import dispatch_rules
from .docs import document
from .pytypes import TypeScope
from .records import (METH_NOARGS, METH_O, METH_VARARGS, Candidate, Cast, Companion, Constant,
                      Descriptor, DirectorClass, EntryPoint, Forward, GlobalVariable, MethodEntry,
                      Module, PointerClass, Result, WrappedClass)
from .naming import GeneratorError, pointer_descriptor_name, spell, unqualified

REFUSE_PLAIN = 'accessing abstract class or protected constructor'
# Comparison operators of a class with itself, and their Python names.
COMPARISONS = {'operator==': '__eq__', 'operator!=': '__ne__'}
OVERLOAD_HEAD = ("Wrong number or type of arguments for overloaded function '{}'.\n"
                 '  Possible C/C++ prototypes are:\n')


class Builder:
    def __init__(self, manifest: Manifest, headers: Headers, siblings: list[Manifest]):
        self.m = manifest
        self.h = headers
        self.siblings = siblings
        self.descriptors: dict[str, Descriptor] = {}

    # descriptors

    def descriptor(self, name: str, readable: str) -> Descriptor:
        d = self.descriptors.get(name)
        if d is None:
            d = self.descriptors[name] = Descriptor(name, readable)
        return d

    def descriptor_for(self, target: CType) -> Descriptor:
        if target.kind == 'typedef' and target.inner.kind == 'record' and '<' not in target.inner.name:
            # A typedef of a plain struct names the struct's descriptor, with
            # the typedef as the other spelling.
            name, readable = pointer_descriptor_name(target.inner)
            return self.descriptor(name, f'{target.name} *|{readable}')
        return self.descriptor(*pointer_descriptor_name(target))

    def class_descriptor(self, cls: str) -> Descriptor:
        return self.descriptor_for(CType('record', cls))

    def add_cast(self, target: Descriptor, source: Descriptor,
                 derived_cpp: str | None, base_cpp: str | None):
        if any(c.source is source for c in target.casts):
            return
        target.casts.append(Cast(source, f'cast{source.name}To{target.name}', derived_cpp,
                                 base_cpp))

    # classes

    def header_class(self, name: str) -> Class:
        cls = self.h.classes.get(name)
        if cls is None:
            raise GeneratorError(f'class {name} is not defined by any header')
        return cls

    def ancestors(self, name: str) -> list[tuple[str, bool]]:
        """Public ancestors, nearest first, with whether headers declare them."""
        out = []
        while True:
            cls = self.h.classes.get(name)
            if cls is not None:
                bases = [b for b, access in cls.bases if access == 'public']
                if len(bases) > 1:
                    raise GeneratorError(f'{name}: more than one public base')
                base = bases[0] if bases else None
            else:
                base = self.m.bases.get(name)
            if base is None:
                return out
            out.append((base, base in self.h.classes))
            name = base

    def candidate(self, cls: str, fn: Function, entry: str, function: str, first: int,
                  ctor: bool, director_ctor: bool = False) -> Candidate:
        """One signature: `first` is the number of the first C++ parameter
        (2 after `self` or a director's Python object, else 1)."""
        args = []
        if not ctor and not fn.static:
            args.append(conversions.self_argument(cls, entry, fn.const, self.class_descriptor(cls)))
        slot = first - 1
        for j, p in enumerate(fn.params):
            arg = conversions.argument(first + j, slot, p, entry, self.descriptor_for,
                                       self.m.callable_announcement, cls, self.m.strict_scalars,
                                       self.m.value_protocols)
            arg.name = p.name or f'arg{j + 1}'
            if arg.slot is not None:
                slot += 1
            args.append(arg)
        python = [a for a in args if a.slot is not None]
        # Constructors of director classes also take the Python object first.
        base = 1 if director_ctor else 0
        required = base + sum(1 for a in python if not a.optional)
        types = (['PyObject *'] if director_ctor else []) + [spell(p.type) for p in fn.params]
        name = cls if ctor else fn.name
        proto = f"{cls}::{name}({','.join(types)})" + (' const' if fn.const else '')
        res = Result('value', cls, descriptor=self.class_descriptor(cls)) if ctor else \
            conversions.result(fn.result, entry, self.descriptor_for)
        if not ctor and not fn.static and res.kind in ('pointer', 'reference'):
            res.lent = True
            res.may_be_self = res.descriptor is self.class_descriptor(cls)
        return Candidate(function, proto, required, base + len(python), args, res,
                         f'new {cls}' if ctor else fn.name, fn.static, fn.const)

    def entry_point(self, entry: str, cands_fns: list[Function], build) -> EntryPoint:
        """Wraps one or several signatures behind the Python name `entry`."""
        single = len(cands_fns) == 1
        cands = [build(fn, f'wrap_{entry}' if single else f'wrap_{entry}_{i + 1}')
                 for i, fn in enumerate(cands_fns)]
        ep = EntryPoint(entry, f'wrap_{entry}', METH_VARARGS, cands)
        if single:
            c = cands[0]
            if c.min_args == c.max_args == 1:
                ep.flags = METH_O
            elif c.max_args == 0:
                ep.flags = METH_NOARGS
        else:
            ep.dispatch = dispatch_rules(cands)
            ep.max_args = max(c.max_args for c in cands)
            ep.message = OVERLOAD_HEAD.format(entry) + ''.join(
                f'    {c.prototype}\n' for c in cands)
        return ep

    def constructor(self, cls: Class, director: bool) -> EntryPoint | None:
        public = [c for c in cls.constructors if c.access == 'public']
        refuse = cls.abstract or (bool(cls.constructors) and not public)
        if not director and refuse:
            return None
        usable = [c for c in cls.constructors if (c.access == 'public'
                  or (director and c.access == 'protected')) and not _moves(c)]
        if not cls.constructors:
            usable = [Function(cls.name, 'public', [])]
        # A value class is copied from Python; a class Python derives from is not.
        if director:
            usable = [c for c in usable if not _is_copy(c, cls.name)]
        entry = f'new_{cls.name}'
        first = 2 if director else 1
        ep = self.entry_point(entry, usable, lambda fn, name: self.candidate(
            cls.name, fn, entry, name, first, ctor=True, director_ctor=director))
        ep.takes_self, ep.refuse_plain = director, refuse
        return ep

    def members(self, cls: Class, director: bool) -> list[EntryPoint]:
        """Public members, and the protected ones of a class Python may derive
        from (open only inside their own override)."""
        groups: dict[str, list[Function]] = {}
        for fn in cls.methods:
            # Host text converts to and from str, which compares itself.
            if fn.name in COMPARISONS and fn.access == 'public' and len(fn.params) == 1 and \
                    fn.params[0].type.kind == 'lvref' and fn.params[0].type.inner.name == cls.name \
                    and cls.name not in (conversions.STRING, conversions.STRING_ARRAY):
                groups.setdefault(fn.name, []).append(fn)
                continue
            if fn.name.startswith('operator') or _moves(fn) or not (
                    fn.access == 'public' or (director and fn.access == 'protected')):
                continue
            if f'{cls.name}::{fn.name}' in self.m.skip:
                continue
            groups.setdefault(fn.name, []).append(fn)
        out = []
        for name, fns in groups.items():
            if len({f.static for f in fns}) > 1:
                raise GeneratorError(f'{cls.name}::{name}: static and instance overloads mixed')
            python_name = COMPARISONS.get(name, name)
            entry = f'{cls.name}_{python_name}'
            ep = self.entry_point(entry, fns, lambda fn, fname: self.candidate(
                cls.name, fn, entry, fname, 1 if fn.static else 2, ctor=False))
            # A Python keyword cannot name an attribute: it gets a trailing '_'.
            ep.member = python_name + '_' if keyword.iskeyword(python_name) else python_name
            ep.static = fns[0].static
            ep.comparison = name in COMPARISONS
            for c, fn in zip(ep.candidates, fns):
                c.virtual, c.pure = director and fn.virtual, fn.pure
                c.protected, c.owner = fn.access == 'protected', cls.name
                c.doc = fn.doc
            out.append(ep)
        for v in cls.variables:
            if not v.static and v.access == 'public':
                out += self.field_accessors(cls, v, director)
        for name in self.m.handwritten.get(cls.name, []):
            # Written in wrap/: only its place in the table and the proxy class.
            out.append(EntryPoint(f'{cls.name}_{name}', f'wrap_{cls.name}_{name}', METH_VARARGS,
                                  [], member=name))
        return out

    def field_accessors(self, cls: Class, v: Variable, director: bool) -> list[EntryPoint]:
        """A public data member is read and written through `<Class>_<m>_get`
        and `<Class>_<m>_set`, on which the proxy class builds a property. A
        member of class type is read in place (the wrapper points into the
        object); a pointer to an object of a class Python may derive from is
        the host's to delete with its owner, so the setter takes the object
        over from its wrapper."""
        directors = {c.name for c in self.m.classes if c.director}
        out = []
        for what in ('set', 'get'):
            entry = f'{cls.name}_{v.name}_{what}'
            args = [conversions.self_argument(cls.name, entry, False,
                                              self.class_descriptor(cls.name))]
            if what == 'set':
                value = conversions.argument(2, 1, Param(v.name, v.type), entry,
                                             self.descriptor_for, '', cls.name,
                                             self.m.strict_scalars)
                value.disown = v.type.kind == 'pointer' and v.type.inner.name in directors
                value.name = v.name
                args.append(value)
                result = Result('void')
            else:
                result = conversions.field_result(v.type, entry, self.descriptor_for)
            count = len(args)
            cand = Candidate(f'wrap_{entry}', f'{cls.name}::{v.name}', count, count, args,
                             result, v.name, doc=v.doc)
            out.append(EntryPoint(entry, f'wrap_{entry}', METH_O if count == 1 else METH_VARARGS,
                                  [cand], member=f'{v.name}_{what}', field=v.name,
                                  accessor=what))
        return out

    def virtual_set(self, name: str) -> list[tuple[str, Function]]:
        """The virtual members of a class and its ancestors that a subclass
        can override, each signature once with its nearest declaration."""
        chain = [name] + [b for b, declared in self.ancestors(name) if declared]
        found: dict[tuple, tuple[str, Function]] = {}
        for owner in reversed(chain):
            for fn in self.h.classes[owner].methods:
                if fn.virtual and fn.access != 'private':
                    key = (fn.name, tuple(spell(p.type) for p in fn.params), fn.const)
                    found[key] = (owner, fn)
        return list(found.values())

    def director_class(self, cls: Class, ctor: EntryPoint) -> DirectorClass:
        directors = {c.name for c in self.m.classes if c.director}
        virtuals = self.virtual_set(cls.name)
        counts: dict[str, set[int]] = {}
        for _, fn in virtuals:
            counts.setdefault(fn.name, set()).add(len(fn.params))
        forwards = []
        for owner, fn in virtuals:
            where = f'{owner}::{fn.name}'
            args = [conversions.forward_argument(p, i + 1, directors, self.descriptor_for)
                    for i, p in enumerate(fn.params)]
            for a, p in zip(args, fn.params):
                a.type = p.type
            result = conversions.forward_result(fn.result, where, self.descriptor_for)
            forwards.append(Forward(fn.name, owner, args, result, fn.const,
                                    fn.access == 'protected', fn.pure, len(counts[fn.name]) > 1,
                                    fn.doc))
        companions = []
        chain = [cls.name] + [b for b, declared in self.ancestors(cls.name) if declared]
        seen = set()
        for owner in chain:
            for fn in self.h.classes[owner].methods:
                key = (fn.name, tuple(spell(p.type) for p in fn.params), fn.const)
                if fn.access != 'protected' or fn.static or key in seen:
                    continue
                seen.add(key)
                companions.append(Companion(
                    fn.name, owner, [(spell(p.type), p.name or f'arg{i + 1}')
                                     for i, p in enumerate(fn.params)],
                    spell(fn.result), fn.const, fn.pure))
        ctors = [[(a.spelling, f'arg{a.number}') for a in c.args] for c in ctor.candidates]
        return DirectorClass(cls.name, ctors, forwards, companions)

    def wrapped_class(self, entry) -> WrappedClass:
        cls = self.header_class(entry.name)
        desc = self.class_descriptor(cls.name)
        ancestors = self.ancestors(cls.name)
        for ancestor, declared in ancestors:
            if declared:
                self.class_descriptor(ancestor)
        base = ancestors[0][0] if ancestors else None
        python_base = None
        if base is not None:
            if any(c.name == base for c in self.m.classes):
                python_base = base
            elif self.m.imports:
                python_base = f'{self.m.imports[0]}.{base}'
        constants = [Constant(f'{cls.name}_{n}', v, f'{cls.name}::{n}') for e in cls.enums
                     if e.access == 'public' for n, v in e.enumerators]
        variables = []
        for v in cls.variables:
            if not v.static or v.access != 'public':
                continue
            # A constant of a scalar type that the header gives a number is a
            # number of the class, as its enumerators are, rather than a
            # variable to read through cvar.
            number = conversions.constant_number(v.type)
            if number and v.value is not None:
                constants.append(Constant(f'{cls.name}_{v.name}', v.value,
                                          f'{cls.name}::{v.name}', number))
                continue
            variables.append(GlobalVariable(f'{cls.name}_{v.name}', f'{cls.name}::{v.name}',
                                            spell(unqualified(v.type)), self.descriptor_for(v.type),
                                            v.type.const, v.doc))
        ctor = self.constructor(cls, entry.director)
        wrapped = WrappedClass(cls.name, entry.family, entry.header, entry.director, desc, base,
                               python_base, cls.polymorphic, ctor,
                               self.members(cls, entry.director), constants, variables,
                               comment=cls.doc)
        if entry.director:
            wrapped.director_class = self.director_class(cls, ctor)
        return wrapped

    def pointer_class(self, name: str, element: str) -> PointerClass:
        if element not in conversions.SCALAR_CONVERTERS:
            raise GeneratorError(f'pointer class {name}: {element} is not a scalar')
        own = self.class_descriptor(name)
        target = self.descriptor_for(CType('builtin', element))
        self.add_cast(target, own, None, None)
        return PointerClass(name, element, own, target, conversions.SCALAR_CONVERTERS[element],
                            conversions.SCALAR_RESULTS[element])

    def casts(self):
        """Every class with a descriptor converts to each ancestor with one."""
        names = list(self.h.classes) + [n for n in self.m.bases if n not in self.h.classes]
        for name in names:
            source = self.descriptors.get(pointer_descriptor_name(CType('record', name))[0])
            if source is None:
                continue
            for base, _ in self.ancestors(name):
                target = self.descriptors.get(pointer_descriptor_name(CType('record', base))[0])
                if target is None:
                    continue
                both = name in self.h.classes and base in self.h.classes
                self.add_cast(target, source, name if both else None, base if both else None)
        for target, sources in self.m.casts.items():
            for s in sources:
                if target not in self.descriptors or s not in self.descriptors:
                    raise GeneratorError(f'{self.m.source}: cast {s} -> {target} names an '
                                         'unknown type')
                self.add_cast(self.descriptors[target], self.descriptors[s], None, None)
        for d in self.descriptors.values():
            d.casts.sort(key=lambda c: c.source.name.encode())

    def build(self) -> Module:
        pointer_classes = [self.pointer_class(n, t) for n, t in self.m.pointer_classes]
        classes = [self.wrapped_class(e) for e in self.m.classes]
        if self.m.value_protocols:
            protocols.decide(self, classes)
        repeated = sorted(n for n in self.m.types if n in self.descriptors)
        if repeated:
            raise GeneratorError(f'{self.m.source}: the headers derive these types; remove them '
                                 f'from the manifest: {" ".join(repeated)}')
        for name, readable in self.m.types.items():
            self.descriptor(name, readable)
        self.casts()
        descriptors = sorted(self.descriptors.values(), key=lambda d: d.name.encode())
        for i, d in enumerate(descriptors):
            d.index = i

        entries = [MethodEntry('SWIG_PyInstanceMethod_New', 'swigrt::PyInstanceMethod_New', METH_O),
                   MethodEntry('SWIG_PyStaticMethod_New', 'swigrt::PyStaticMethod_New', METH_O)]
        for p in pointer_classes:
            for what, flags in (('new', METH_VARARGS), ('delete', METH_O), ('assign', METH_VARARGS),
                                ('value', METH_O), ('cast', METH_O), ('frompointer', METH_O),
                                ('swigregister', METH_O)):
                entries.append(MethodEntry(p.entry(what), f'wrap_{p.entry(what)}', flags,
                                           what not in ('new', 'swigregister')))
            entries.append(MethodEntry(p.entry('swiginit'), 'swigrt::ShadowInit', METH_VARARGS))
        functions = [MethodEntry(name, f'wrap_{name}', METH_NOARGS) for name in self.m.functions]
        entries += functions
        for c in classes:
            if c.constructor:
                entries.append(MethodEntry(c.constructor.entry, c.constructor.function,
                                           c.constructor.flags, True))
            entries.append(MethodEntry(c.delete_entry, f'wrap_{c.delete_entry}', METH_O, True))
            entries += [MethodEntry(m.entry, m.function, m.flags,
                                    bool(m.candidates or m.protocol)) for m in c.members]
            # A writable static variable is also reached through its own pair of
            # functions, on which the proxy class builds a class property; a
            # read-only one only through cvar.
            for v in c.variables:
                if not v.readonly:
                    entries.append(MethodEntry(f'{v.name}_get', f'wrap_{v.name}_get', METH_VARARGS))
                    entries.append(MethodEntry(f'{v.name}_set', f'wrap_{v.name}_set', METH_O))
            if c.director:
                entries.append(MethodEntry(f'disown_{c.name}', f'wrap_disown_{c.name}', METH_O,
                                           True))
            entries.append(MethodEntry(f'{c.name}_swigregister', f'wrap_{c.name}_swigregister',
                                       METH_O))
            entries.append(MethodEntry(f'{c.name}_swiginit', 'swigrt::ShadowInit', METH_VARARGS))

        start = [Constant(name, self.string_macro(name), name) for name in self.m.string_constants]
        installs: list[Constant | GlobalVariable] = []
        if classes:
            # The first class's constants go in with the explicit ones, before the
            # link object exists; its variables lead the link's registrations.
            start += classes[0].constants
            installs += classes[0].variables
            for c in classes[1:]:
                installs += c.constants + c.variables
        api = self.h.macros.get(self.m.api_version_macro, '') if self.m.api_version_macro else ''
        module = Module(self.m.name, self.m.proxy, self.m.source, self.m.namespace,
                        [c.header for c in self.m.classes], self.m.imports, pointer_classes,
                        classes, descriptors, entries, start, installs, api, functions,
                        [(self.m.resource_table, key) for key in self.m.resources],
                        self.m.value_protocols, self.m.strict_scalars)
        scope = self.type_scope()
        for c in classes:
            shape = c.protocols.shape if c.protocols else None
            if shape and shape.python:
                scope.sequences[c.name] = shape.python
            if shape:
                scope.shapes[c.name] = shape.itself
        document(module, scope)
        return module

    def type_scope(self) -> TypeScope:
        """The classes the module's Python types can name: its own and those
        of the modules sharing its type table, and the enumerators whose
        values stand for default arguments."""
        scope = TypeScope(self.m.proxy)
        for m in self.siblings + [self.m]:
            scope.add_module(m.proxy, [c.name for c in m.classes], m.pointer_classes)
        for cls in self.h.classes.values():
            for e in cls.enums:
                for n, v in e.enumerators:
                    scope.enumerators[f'{cls.name}::{n}'] = v
        return scope

    def string_macro(self, name: str) -> str:
        text = self.h.macros.get(name)
        if text is None or not (text.startswith('"') and text.endswith('"')):
            raise GeneratorError(f'{name} is not a string macro of the headers')
        raw = codecs.escape_decode(text[1:-1].encode())[0]
        return raw.decode('utf-8', 'surrogateescape')


def _moves(f: Function) -> bool:
    """Python has no object to move from: members taking an rvalue reference
    are not wrapped."""
    return any(p.type.kind == 'rvref' for p in f.params)


def _is_copy(f: Function, cls: str) -> bool:
    if len(f.params) != 1:
        return False
    t = f.params[0].type
    return t.kind in ('lvref', 'rvref') and t.inner.kind == 'record' and t.inner.name == cls


def build(manifest: Manifest, headers: Headers, siblings: list[Manifest] | None = None) -> Module:
    """The model of a module; `siblings` are the manifests of the modules
    that share its type table, whose classes its Python types may name."""
    return Builder(manifest, headers, siblings or []).build()
