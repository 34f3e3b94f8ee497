// Self-test of the host stand-in: value classes, the scripting engine and the
// host classes' statics and lifetimes. Prints each failed check; exits non-zero
// if any failed.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <openvorla/VFnPlugin.h>
#include <openvorla/VPxCameraSet.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxIkSolverNode.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VPxParticleAttributeMapperNode.h>
#include <openvorla/VPxPolyTweakUVInteractiveCommand.h>
#include <openvorla/VPxTransformationMatrix.h>
#include <openvorla/VPxUIControl.h>
#include <openvorla/VStatus.h>
#include <openvorla/VStringArray.h>
#include <openvorla/VTypeId.h>

#include <scriptrunner/TapiCast.h>
#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>
#include <scriptrunner/TpythonObjectWithLock.h>
#include <scriptrunner/TstringId.h>

#include <basekit/Tlog.h>

#include <standin/Lifetime.h>
#include <standin/Objects.h>

#include <cstdio>
#include <cstring>
#include <string>
#include <thread>
#include <type_traits>

using namespace OPENVORLA_NAMESPACE;

namespace {

int gFailures = 0;

void check(bool ok, const char *what, const char *file, int line) {
  if (ok) return;
  ++gFailures;
  std::fprintf(stderr, "%s:%d: check failed: %s\n", file, line, what);
}

#define CHECK(cond) check((cond), #cond, __FILE__, __LINE__)

bool contains(const std::string &text, const char *part) {
  return text.find(part) != std::string::npos;
}

// Runs body on a thread that Python has never seen.
template <typename F>
void onNewThread(F body) {
  std::thread(body).join();
}

// Plain construction of the classes the module must refuse to build plainly.
static_assert(std::is_abstract_v<VPxData>);
static_assert(!std::is_default_constructible_v<VPxIkSolverNode>);
static_assert(!std::is_default_constructible_v<VPxUIControl>);
static_assert(!std::is_abstract_v<VPxPolyTweakUVInteractiveCommand>);

void testStatus() {
  static_assert(sizeof(VStatus) == 3);
  unsigned char bytes[3];
  VStatus ok;
  std::memcpy(bytes, &ok, 3);
  CHECK(bytes[0] == 0 && bytes[1] == 0xFF && bytes[2] == 1);
  CHECK(ok && !ok.error() && ok == VStatus::kSuccess);

  VStatus unknown(VStatus::kUnknownParameter);
  std::memcpy(bytes, &unknown, 3);
  CHECK(bytes[0] == 5 && bytes[1] == 0xFF && bytes[2] == 0);
  CHECK(!unknown && unknown.error() && unknown.statusCode() == VStatus::kUnknownParameter);
  CHECK(unknown.errorString() == "Unknown parameter");
  CHECK(VStatus(VStatus::kFailure).errorString() == "Failure");

  VStatus a(VStatus::kInvalidParameter, "Plug 'größe' is not connectable");
  VStatus b(VStatus::kInvalidParameter, "Another message");
  CHECK(std::strcmp(a.errorString().asUTF8(), "Plug 'größe' is not connectable") == 0);
  CHECK(b.errorString() == "Another message");
  CHECK(a.statusCode() == VStatus::kInvalidParameter && a.error() && a == b);
  std::memcpy(bytes, &a, 3);
  CHECK(bytes[0] == 3 && bytes[1] != 0xFF && bytes[2] == 0);

  Tlog::clear();
  a.perror("connect");
  auto log = Tlog::entries();
  CHECK(log.size() == 1 && log.back() == "connect: Plug 'größe' is not connectable");

  a.clear();
  CHECK(a && a.errorString() == "Success");
}

void testStrings() {
  const char *utf8 = "héllo wörld ✓ 𝄞";
  VString s(utf8);
  CHECK(s.numChars() == 15 && s.length() == 15);
  CHECK(s.asWChar()[1] == L'é' && s.asWChar()[12] == 0x2713 && s.asWChar()[14] == 0x1D11E);
  CHECK(std::strcmp(s.asUTF8(), utf8) == 0);
  CHECK(VString(L"héllo wörld ✓ 𝄞") == s);

  // Malformed input: a lone continuation byte, a truncated sequence, an
  // overlong slash and an encoded surrogate each become one U+FFFD.
  VString bad(
      "a\x80"
      "b\xE2\x82"
      "c\xC0\xAF"
      "d\xED\xA0\x80");
  CHECK(bad == VString(L"a\uFFFDb\uFFFDc\uFFFDd\uFFFD"));

  // Changes made through the engine's view must reach the UTF-8 view.
  const char *before = s.asUTF8();
  CHECK(s.asUTF8() == before);
  static_cast<Tstring &>(s).set(L"x\u00DF", 2);
  CHECK(std::strcmp(s.asUTF8(), "x\xC3\x9F") == 0);

  VString sum = VString("ab") + VString(L"ç");
  sum += "d";
  CHECK(sum == "abçd" && sum != "abcd" && sum.numChars() == 4);

  VStringArray array;
  array.append("one");
  array.append("twö");
  TstringArray &engine = TapiCast::stringArray(array);
  CHECK(engine.length() == 2 && engine[1] == Tstring(L"twö"));
  engine.append(Tstring("three"));
  CHECK(array.length() == 3 && array[2] == "three");
  VStringArray copy(array);
  CHECK(array.set("uno", 0) == VStatus::kSuccess &&
        array.set("x", 3) == VStatus::kInvalidParameter);
  CHECK(array[0] == "uno" && copy[0] == "one");
  array.clear();
  CHECK(array.length() == 0 && copy.length() == 3);
}

void testObjectsAndStatics() {
  VObject null;
  CHECK(null.isNull() && null.apiType() == VFn::kInvalid && null == VObject());

  VObject a = standin::makeObject(VFn::kDependencyNode, "node1");
  VObject b = standin::makeObject(VFn::kDependencyNode, "node1");
  VObject c(a);
  CHECK(!a.isNull() && a.apiType() == VFn::kDependencyNode);
  CHECK(a == c && a != b && a != null);
  c = b;
  a = VObject();
  CHECK(c == b && a.isNull() && std::strcmp(standin::objectName(c), "node1") == 0);

  CHECK(!VPxNode::message.isNull() && VPxNode::message != VPxNode::caching);
  CHECK(std::strcmp(standin::objectName(VPxNode::caching), "VPxNode.caching") == 0);
  CHECK(std::strcmp(standin::objectName(VPxParticleAttributeMapperNode::outValuePP),
                    "VPxParticleAttributeMapperNode.outValuePP") == 0);
  CHECK(VPxTransformationMatrix::baseTransformationMatrixId == VTypeId(0x70000));
  CHECK(VTypeId().id() == 0 && VTypeId(7) != VTypeId(8));
  CHECK(VFnPlugin::kDefaultDataLocation == "default");
  CHECK(VFnPlugin().object().isNull());
}

void testLifetimes() {
  standin::resetCounts();
  {
    VPxCameraSet set;
    CHECK(standin::aliveCount("VPxCameraSet") == 1 && standin::aliveCount("VPxNode") == 1);
    VPxTransformationMatrix copy(VPxTransformationMatrix::identity);
    CHECK(standin::constructedCount("VPxTransformationMatrix") == 1);
  }
  CHECK(standin::destroyedCount("VPxCameraSet") == 1 && standin::aliveCount("VPxNode") == 0);
  CHECK(standin::aliveCount("VPxTransformationMatrix") == 0);

  int before = TstringId::constructedCount();
  {
    TstringId id("TpythonObjectStrings", "rProblemWithApiObjectMethod");
    CHECK(std::strcmp(id.key(), "rProblemWithApiObjectMethod") == 0);
    CHECK(TstringId::constructedCount() == before + 1);
  }
  CHECK(TstringId::destroyedCount() == before + 1);
}

// Called with the interpreter lock released by the main thread.
void testLock() {
  CHECK(TpythonLock::captureCount() == 0);
  onNewThread([] {
    TpythonLock outer;
    CHECK(PyGILState_Check() && TpythonLock::captureCount() == 1);
    {
      TpythonLock inner;
      CHECK(TpythonLock::captureCount() == 2);
      PyObject *sum =
          PyRun_String("sum(range(10))", Py_eval_input, PyEval_GetBuiltins(), PyEval_GetBuiltins());
      CHECK(sum && PyLong_AsLong(sum) == 45);
      Py_XDECREF(sum);
    }
    CHECK(PyGILState_Check() && TpythonLock::captureCount() == 1);
  });
  CHECK(TpythonLock::captureCount() == 0);
}

void testObjectWithLock() {
  onNewThread([] {
    TpythonLock lock;
    PyObject *text = PyUnicode_FromString("héllo wörld ✓ 𝄞");
    Py_ssize_t refs = Py_REFCNT(text);
    {
      TpythonObjectWithLock held(text);
      CHECK(Py_REFCNT(text) == refs + 1 && TpythonLock::captureCount() == 2);
      Tstring value;
      CHECK(held.getValue(value) && value == Tstring("héllo wörld ✓ 𝄞"));
    }
    CHECK(Py_REFCNT(text) == refs);

    const char *refused[] = {"b'bytes'", "None", "42", "['a', 1]"};
    PyObject *globals = PyDict_New();
    PyDict_SetItemString(globals, "__builtins__", PyEval_GetBuiltins());
    for (const char *source : refused) {
      PyObject *object = PyRun_String(source, Py_eval_input, globals, globals);
      Tstring value("kept");
      CHECK(!TpythonObjectWithLock(object).getValue(value) && value == Tstring("kept"));
      Py_XDECREF(object);
    }
    Tstring none;
    CHECK(!TpythonObjectWithLock().getValue(none));

    for (const char *source : {"['x', 'ÿ']", "('x', 'ÿ')"}) {
      PyObject *object = PyRun_String(source, Py_eval_input, globals, globals);
      TstringArray array;
      array.append(Tstring("stale"));
      CHECK(TpythonObjectWithLock(object).getValue(array));
      CHECK(array.length() == 2 && array[1] == Tstring(L"ÿ"));
      Py_XDECREF(object);
    }
    PyObject *mixed = PyRun_String("['a', 'b', 3, 'd']", Py_eval_input, globals, globals);
    TstringArray partial;
    CHECK(!TpythonObjectWithLock(mixed).getValue(partial) && partial.length() == 2);
    Py_XDECREF(mixed);
    TstringArray untouched;
    untouched.append(Tstring("kept"));
    CHECK(!TpythonObjectWithLock(Py_None).getValue(untouched) && untouched.length() == 1);

    TpythonObjectWithLock out;
    out.setValue(Tstring(L"𝄞 and \0 zero", 12));
    PyObject *expected = PyUnicode_FromWideChar(L"𝄞 and \0 zero", 12);
    CHECK(out.object() && PyUnicode_Compare(out.object(), expected) == 0);
    Py_DECREF(expected);
    Py_DECREF(globals);
    Py_DECREF(text);
  });
}

void testExceptionReport() {
  TpythonInterpreter &interpreter = TpythonInterpreter::interpreter();
  // Nothing pending, called without the lock from a thread Python has never seen.
  onNewThread([&] { CHECK(!interpreter.catchAndReportException()); });

  onNewThread([&] {
    TpythonLock lock;
    PyObject *globals = PyDict_New();
    PyDict_SetItemString(globals, "__builtins__", PyEval_GetBuiltins());
    PyObject *done =
        PyRun_String("def explode():\n    return 1 / 0\n", Py_file_input, globals, globals);
    Py_XDECREF(done);
    PyObject *result = PyObject_CallNoArgs(PyDict_GetItemString(globals, "explode"));
    CHECK(!result && PyErr_Occurred());
    Tlog::clear();
    CHECK(interpreter.catchAndReportException());
    CHECK(!PyErr_Occurred());
    auto log = Tlog::entries();
    CHECK(log.size() == 1);
    const std::string entry = log.empty() ? std::string() : log.front();
    CHECK(entry.rfind("Python exception in plug-in:\nTraceback (most recent call last):\n", 0) ==
          0);
    CHECK(contains(entry, ", line 2, in explode\n"));
    CHECK(contains(entry, "\nZeroDivisionError: division by zero") && entry.back() != '\n');
    CHECK(!interpreter.catchAndReportException() && Tlog::entries().size() == 1);
    Py_DECREF(globals);
  });
}

}  // namespace

int main() {
  testStatus();
  testStrings();
  testObjectsAndStatics();
  testLifetimes();

  Py_InitializeEx(0);
  PyThreadState *mainThread = PyEval_SaveThread();
  testLock();
  testObjectWithLock();
  testExceptionReport();
  PyEval_RestoreThread(mainThread);
  Py_FinalizeEx();

  if (gFailures)
    std::fprintf(stderr, "host_selftest: %d check(s) failed\n", gFailures);
  else
    std::printf("host_selftest: all checks passed\n");
  return gFailures ? 1 : 0;
}
