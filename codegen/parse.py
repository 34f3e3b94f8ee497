"""Reads host headers with libclang into plain declarations.

Nothing here decides how a declaration is wrapped: the model does that. This
module only reports what the headers say, with every type turned into a CType
tree whose names are relative to the host's SDK namespace.
"""
from __future__ import annotations

import os
import re
from dataclasses import dataclass, field

import clang.cindex as ci

K = ci.CursorKind
T = ci.TypeKind


@dataclass(frozen=True)
class CType:
    """A C++ type as declared. `kind` is one of builtin, record, enum, typedef,
    pointer, lvref, rvref, array, function, memberptr, unexposed."""
    kind: str
    name: str = ''             # builtin spelling, qualified name, or the spelling
                               # of an 'unexposed' type the reader cannot take apart
    const: bool = False
    inner: 'CType | None' = None   # pointee, element, typedef target, result
    size: int = 0              # array length
    args: tuple = ()           # function parameter types
    owner: str = ''            # class of a member pointer


@dataclass
class Param:
    name: str
    type: CType
    default: str | None = None   # default argument text, None when required


@dataclass
class Function:
    name: str
    access: str                  # public, protected, private
    params: list[Param]
    result: CType | None = None  # None for constructors and destructors
    static: bool = False
    const: bool = False
    virtual: bool = False
    pure: bool = False
    doc: str = ''                # the comment above the declaration


@dataclass
class Enum:
    name: str
    access: str
    enumerators: list[tuple[str, int]]


@dataclass
class Variable:
    name: str
    type: CType
    access: str
    static: bool
    doc: str = ''
    value: int | float | None = None   # a literal initializer's number


def _literal(cursor) -> int | float | None:
    """The number a declaration is initialised with, when it is a literal."""
    spelled = [t.spelling for t in cursor.get_tokens()]
    if '=' not in spelled:
        return None
    words = spelled[spelled.index('=') + 1:]
    sign = -1 if words[:1] == ['-'] else 1
    words = words[1:] if sign < 0 else words
    if len(words) != 1:
        return None
    text = words[0].rstrip('uUlL')
    try:
        return sign * int(text, 0)
    except ValueError:
        pass
    try:
        return sign * float(text.rstrip('fF'))
    except ValueError:
        return None


@dataclass
class Class:
    name: str                   # qualified below the SDK namespace
    header: str                 # path relative to the include directory
    bases: list[tuple[str, str]] = field(default_factory=list)   # (name, access)
    constructors: list[Function] = field(default_factory=list)
    destructor: Function | None = None
    methods: list[Function] = field(default_factory=list)
    enums: list[Enum] = field(default_factory=list)
    variables: list[Variable] = field(default_factory=list)
    abstract: bool = False
    polymorphic: bool = False
    doc: str = ''               # the comment above the class, or the header's
                                # opening comment when the header is named after it


@dataclass
class Headers:
    classes: dict[str, Class]
    macros: dict[str, str]      # object-like macros: name -> replacement text
    # Operators declared outside the classes (`VVector operator*(double, const
    # VVector &)`), in the order the headers declare them.
    operators: list[Function] = field(default_factory=list)


class ParseError(Exception):
    pass


def _join(tokens: list[str]) -> str:
    """Source text of an expression from its tokens: 'VSpace::kTransform', '-1'."""
    text = ' '.join(tokens)
    text = re.sub(r'\s*::\s*', '::', text)
    return re.sub(r'^([-+])\s+', r'\1', text)


def _deleted(cursor) -> bool:
    tokens = [t.spelling for t in cursor.get_tokens()]
    return tokens[-2:] == ['=', 'delete'] or tokens[-3:-1] == ['=', 'delete']


def comment_text(raw: str | None) -> str:
    """The text of a `//` or `/* */` comment, its markers and the one space
    after them removed, its lines kept."""
    if not raw:
        return ''
    lines = []
    for line in raw.strip().splitlines():
        line = line.strip()
        line = re.sub(r'^(///?<?|/\*+|\*+/|\*)', '', line)
        line = re.sub(r'\*+/$', '', line)
        lines.append(line[1:] if line.startswith(' ') else line)
    while lines and not lines[0].strip():
        lines.pop(0)
    while lines and not lines[-1].strip():
        lines.pop()
    return '\n'.join(line.rstrip() for line in lines)


def _opening_comment(path: str) -> str:
    """The comment a header opens with: its leading `//` lines."""
    lines = []
    try:
        with open(path, encoding='utf-8', errors='replace') as f:
            for line in f:
                if not line.startswith('//'):
                    break
                lines.append(line)
    except OSError:   # a header given as text, not a file
        return ''
    return comment_text(''.join(lines))


def _access(cursor) -> str:
    spec = cursor.access_specifier
    if spec == ci.AccessSpecifier.PROTECTED:
        return 'protected'
    if spec == ci.AccessSpecifier.PRIVATE:
        return 'private'
    return 'public'


class _Reader:
    def __init__(self, namespace: str, include_dir: str):
        self.strip = tuple(namespace.split('::')) if namespace else ()
        self.include_dir = os.path.realpath(include_dir)

    def qualified(self, decl) -> str:
        parts = []
        c = decl
        while c is not None and c.kind != K.TRANSLATION_UNIT:
            if c.spelling:
                parts.append(c.spelling)
            c = c.semantic_parent
        parts.reverse()
        if self.strip and tuple(parts[:len(self.strip)]) == self.strip:
            parts = parts[len(self.strip):]
        return '::'.join(parts)

    def ctype(self, t) -> CType:
        const = t.is_const_qualified()
        k = t.kind
        if k == T.ELABORATED:
            inner = self.ctype(t.get_named_type())
            return CType(inner.kind, inner.name, const or inner.const, inner.inner,
                         inner.size, inner.args, inner.owner)
        if k == T.POINTER:
            return CType('pointer', const=const, inner=self.ctype(t.get_pointee()))
        if k == T.LVALUEREFERENCE:
            return CType('lvref', inner=self.ctype(t.get_pointee()))
        if k == T.RVALUEREFERENCE:
            return CType('rvref', inner=self.ctype(t.get_pointee()))
        if k == T.CONSTANTARRAY:
            return CType('array', const=const, size=t.element_count,
                         inner=self.ctype(t.element_type))
        if k == T.TYPEDEF:
            decl = t.get_declaration()
            return CType('typedef', self.qualified(decl), const,
                         self.ctype(decl.underlying_typedef_type))
        if k in (T.RECORD, T.ENUM):
            return CType('record' if k == T.RECORD else 'enum',
                         self.qualified(t.get_declaration()), const)
        if k == T.FUNCTIONPROTO:
            return CType('function', inner=self.ctype(t.get_result()),
                         args=tuple(self.ctype(a) for a in t.argument_types()))
        if k == T.MEMBERPOINTER:
            return CType('memberptr', const=const, inner=self.ctype(t.get_pointee()),
                         owner=self.qualified(t.get_class_type().get_declaration()))
        spelling = t.spelling.replace('const ', '').replace(' const', '').strip()
        if not (T.VOID.value <= t.get_canonical().kind.value <= T.NULLPTR.value):
            # Templates and the like: recorded, and refused by the model if it needs them.
            return CType('unexposed', spelling, const)
        return CType('builtin', spelling, const)

    def params(self, cursor) -> list[Param]:
        out = []
        for arg in cursor.get_arguments():
            default = None
            tokens = [tok.spelling for tok in arg.get_tokens()]
            if '=' in tokens:
                default = _join(tokens[tokens.index('=') + 1:])
            out.append(Param(arg.spelling, self.ctype(arg.type), default))
        return out

    def function(self, cursor, with_result: bool) -> Function:
        return Function(
            name=cursor.spelling, access=_access(cursor), params=self.params(cursor),
            result=self.ctype(cursor.result_type) if with_result else None,
            static=cursor.is_static_method(), const=cursor.is_const_method(),
            virtual=cursor.is_virtual_method(), pure=cursor.is_pure_virtual_method(),
            doc=comment_text(cursor.raw_comment))

    def header_of(self, cursor) -> str | None:
        loc = cursor.location.file
        if loc is None:
            return None
        path = os.path.realpath(loc.name)
        if not path.startswith(self.include_dir + os.sep):
            return None
        return os.path.relpath(path, self.include_dir)

    def read_class(self, cursor, header: str) -> Class:
        cls = Class(self.qualified(cursor), header, abstract=cursor.is_abstract_record(),
                    doc=comment_text(cursor.raw_comment))
        if not cls.doc and os.path.splitext(os.path.basename(header))[0] == cursor.spelling:
            cls.doc = _opening_comment(os.path.join(self.include_dir, header))
        for c in cursor.get_children():
            if c.kind != K.CXX_BASE_SPECIFIER and _access(c) == 'private':
                continue
            if c.kind in (K.CONSTRUCTOR, K.CXX_METHOD) and _deleted(c):
                continue
            if c.kind == K.CXX_BASE_SPECIFIER:
                cls.bases.append((self.qualified(c.type.get_declaration()), _access(c)))
            elif c.kind == K.CONSTRUCTOR:
                cls.constructors.append(self.function(c, False))
            elif c.kind == K.DESTRUCTOR:
                cls.destructor = self.function(c, False)
            elif c.kind == K.CXX_METHOD:
                cls.methods.append(self.function(c, True))
            elif c.kind == K.ENUM_DECL:
                cls.enums.append(Enum(c.spelling, _access(c),
                                      [(e.spelling, e.enum_value) for e in c.get_children()
                                       if e.kind == K.ENUM_CONSTANT_DECL]))
            elif c.kind == K.VAR_DECL:
                cls.variables.append(Variable(c.spelling, self.ctype(c.type), _access(c), True,
                                              comment_text(c.raw_comment), _literal(c)))
            elif c.kind == K.FIELD_DECL:
                cls.variables.append(Variable(c.spelling, self.ctype(c.type), _access(c), False,
                                              comment_text(c.raw_comment)))
        cls.polymorphic = any(f.virtual for f in cls.methods) or bool(
            cls.destructor and cls.destructor.virtual)
        return cls


def parse(headers: list[str], include_dirs: list[str], namespace: str,
          unsaved: dict[str, str] | None = None) -> Headers:
    """Parses the given headers (paths relative to include_dirs[0]) as one
    translation unit and returns every class defined under include_dirs[0]."""
    reader = _Reader(namespace, include_dirs[0])
    source = ''.join(f'#include <{h}>\n' for h in headers)
    files = [('__codegen_all.cpp', source)]
    files += list((unsaved or {}).items())
    # Plain `//` comments are the headers' documentation: libclang attaches
    # them to the declaration below them only when asked to.
    args = ['-x', 'c++', '-std=c++17', '-fparse-all-comments'] + [f'-I{d}' for d in include_dirs]
    options = (ci.TranslationUnit.PARSE_SKIP_FUNCTION_BODIES
               | ci.TranslationUnit.PARSE_DETAILED_PROCESSING_RECORD)
    tu = ci.Index.create().parse('__codegen_all.cpp', args=args, unsaved_files=files,
                                 options=options)
    errors = [d for d in tu.diagnostics if d.severity >= ci.Diagnostic.Error]
    if errors:
        raise ParseError('\n'.join(str(d) for d in errors))

    classes: dict[str, Class] = {}
    macros: dict[str, str] = {}
    operators: list[Function] = []

    def visit(cursor):
        for c in cursor.get_children():
            if c.kind == K.NAMESPACE:
                visit(c)
            elif c.kind in (K.CLASS_DECL, K.STRUCT_DECL) and c.is_definition():
                header = reader.header_of(c)
                if header is not None:
                    cls = reader.read_class(c, header)
                    classes[cls.name] = cls
            elif c.kind == K.FUNCTION_DECL and c.spelling.startswith('operator') and \
                    reader.header_of(c) is not None:
                operators.append(reader.function(c, True))
            elif c.kind == K.MACRO_DEFINITION and reader.header_of(c) is not None:
                tokens = [t.spelling for t in c.get_tokens()]
                if len(tokens) >= 2 and tokens[1] != '(':
                    macros[tokens[0]] = ' '.join(tokens[1:])

    visit(tu.cursor)
    return Headers(classes, macros, operators)
