"""What the model decides for Python: the headers' comments, the Python types
of arguments and results, the forms an overload shows, and what the
documentation says an override is to return."""
from codegen import manifest as manifest_mod
from codegen import model as model_mod
from codegen import parse as parse_mod

MANIFEST = '''[module]
name = "_M"
proxy = "M"
namespace = "S"
classes = [
    { name = "Base", family = "f", header = "sdk/Base.h" },
    { name = "Value", family = "f", director = false, header = "sdk/Base.h" },
]
'''

HEADER = '''// The base of the test classes.
//
// Its second paragraph.
#pragma once
namespace S {
class VString { public: VString(); };
class VStringArray { public: VStringArray(); };
class VStatus { public: VStatus(); };
class Other {};
// A value.
class Value { public: Value(); };
class Base {
public:
  enum Mode { kOne = 1, kTwo = 2 };
  Base();
  virtual ~Base();
  // Renames, keeping the old names
  // in aliases.
  VStatus rename(const VString &name, VStringArray &aliases);
  VStringArray names(const VString *prefix = 0, VStatus *status = 0) const;
  Base *parent(Value *v = 0, const char *text = "a\\tb", Mode mode = kTwo, bool deep = true,
               double scale = 1, int in = 3);
  const Value &value() const;
  Other other(Other &o);
  bool pick(int index);
  bool pick(unsigned int index);
  bool pick(bool flag);
  virtual Value made() const;
  virtual Base *owner();
  virtual VStatus check(int &count);
  virtual Mode mode() const;
};
}
'''


def build(tmp_path, header=HEADER, siblings=()):
    (tmp_path / 'm.toml').write_text(MANIFEST)
    (tmp_path / 'sdk').mkdir(exist_ok=True)
    (tmp_path / 'sdk' / 'Base.h').write_text(header)
    m = manifest_mod.load(str(tmp_path / 'm.toml'), 'm.toml')
    headers = parse_mod.parse([c.header for c in m.classes], [str(tmp_path)], m.namespace)
    return model_mod.build(m, headers, list(siblings))


def classes(module):
    return {c.name: c for c in module.classes}


def forms(cls, member):
    ep = next(e for e in cls.members if e.member == member)
    return [f.describe('M') for f in ep.forms]


def test_comments_of_classes_and_members(tmp_path):
    cs = classes(build(tmp_path))
    # A class named after its header has the header's opening comment; any
    # other class the comment right above it.
    assert cs['Base'].comment == 'The base of the test classes.\n\nIts second paragraph.'
    assert cs['Value'].comment == 'A value.'
    rename = next(e for e in cs['Base'].members if e.member == 'rename')
    assert rename.candidates[0].doc == 'Renames, keeping the old names\nin aliases.'
    assert parse_mod.comment_text('/* One.\n * Two. */') == 'One.\nTwo.'


def test_argument_and_result_types(tmp_path):
    base = classes(build(tmp_path))['Base']
    # Output lists are lists; a status reported through a pointer is no argument.
    assert forms(base, 'rename') == [
        "rename(name: str, aliases: list[str]) -> Literal['unknown'] | None"]
    assert forms(base, 'names') == ['names(prefix: str | None = None) -> list[str]']
    # Pointers may be None, references may not; defaults as Python values.
    assert forms(base, 'parent') == [
        "parent(v: Value | None = None, text: str | None = 'a\\tb', mode: int = 2, "
        'deep: bool = True, scale: float = 1.0, in_: int = 3) -> Base | None']
    assert forms(base, 'value') == ['value() -> Value']
    # A host type no module wraps reaches Python as the wrapped pointer.
    assert forms(base, 'other') == ['other(o: SwigPyObject) -> SwigPyObject']
    parent = next(e for e in base.members if e.member == 'parent')
    assert parent.text_signature == (
        "($self, v=None, text='a\\tb', mode=2, deep=True, scale=1.0, in_=3, /)")


def test_overloads_show_the_forms_python_tells_apart(tmp_path):
    base = classes(build(tmp_path))['Base']
    pick = next(e for e in base.members if e.member == 'pick')
    assert len(pick.candidates) == 3 and pick.text_signature is None
    # unsigned int is an int as int is; bool after int is taken by int already.
    assert forms(base, 'pick') == ['pick(index: int) -> bool']
    # The narrower form first is a form of its own.
    header = HEADER.replace('  bool pick(int index);\n  bool pick(unsigned int index);\n', '').replace(
        'bool pick(bool flag);', 'bool pick(bool flag);\n  bool pick(int index);')
    assert forms(classes(build(tmp_path, header))['Base'], 'pick') == [
        'pick(flag: bool) -> bool', 'pick(index: int) -> bool']


def test_classes_and_pointer_classes_of_a_sibling_module(tmp_path):
    sibling = manifest_mod.Manifest('_N', 'N', 'S', [manifest_mod.ClassEntry('Other', 'f')],
                                    pointer_classes=[('intPtr', 'int')])
    base = classes(build(tmp_path, siblings=[sibling]))['Base']
    assert forms(base, 'other') == ['other(o: N.Other) -> N.Other']
    assert forms(base, 'check') == [
        "check(count: N.intPtr | SwigPyObject) -> Literal['unknown'] | None"]
    # What an override receives is the plain pointer, never a pointer class.
    check = next(f for f in base.director_class.forwards if f.name == 'check')
    assert check.python.describe('M') == "check(count: SwigPyObject) -> Literal['unknown'] | None"


def test_what_an_override_is_to_return(tmp_path):
    base = classes(build(tmp_path))['Base']
    returns = {f.name: f.returns for f in base.director_class.forwards}
    assert returns == {
        'made': 'Return a Value; the application keeps a copy.',
        'owner': 'Return a Base or None; the application takes the object over.',
        'check': "Return None when it succeeds, or 'unknown' to leave the decision to the "
                 'application; raise an exception to report a failure.',
        'mode': 'Return an int, a value of Base::Mode.',
    }
    made = next(e for e in base.members if e.member == 'made')
    assert made.doc == ('made() -> Value\n\n'
                        'The application calls it on an instance of a subclass that overrides '
                        'it, as\n    made() -> Value\n'
                        'Return a Value; the application keeps a copy.')
    assert base.doc.split('\n\n')[2:] == [
        'Operations the application calls on a subclass:\n    made() -> Value\n'
        '    owner() -> Base | None\n'
        "    check(count: SwigPyObject) -> Literal['unknown'] | None\n    mode() -> int",
        'Constants:\n    kOne = 1\n    kTwo = 2']
