// Self-test of the host stand-in: value classes, the scripting engine and the
// host classes' statics and lifetimes. Prints each failed check; exits non-zero
// if any failed.
#define PY_SSIZE_T_CLEAN
#include <Python.h>

#include <openvorla/VArgList.h>
#include <openvorla/VBoundingBox.h>
#include <openvorla/VCacheSchema.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VDataBlock.h>
#include <openvorla/VDeviceState.h>
#include <openvorla/VEulerRotation.h>
#include <openvorla/VEvaluationNode.h>
#include <openvorla/VEvent.h>
#include <openvorla/VFileObject.h>
#include <openvorla/VFnPlugin.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VNodeCacheSetupInfo.h>
#include <openvorla/VPoint.h>
#include <openvorla/VPx3dModelView.h>
#include <openvorla/VPxAnimCurveInterpolator.h>
#include <openvorla/VPxCameraSet.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxConstraintCommand.h>
#include <openvorla/VPxContext.h>
#include <openvorla/VPxContextCommand.h>
#include <openvorla/VPxControlCommand.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxFileTranslator.h>
#include <openvorla/VPxGeometryData.h>
#include <openvorla/VPxGeometryIterator.h>
#include <openvorla/VPxIkSolverNode.h>
#include <openvorla/VPxMidiInputDevice.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VPxParticleAttributeMapperNode.h>
#include <openvorla/VPxPolyTweakUVInteractiveCommand.h>
#include <openvorla/VPxSurfaceShape.h>
#include <openvorla/VPxToolCommand.h>
#include <openvorla/VPxTransform.h>
#include <openvorla/VPxTransformationMatrix.h>
#include <openvorla/VPxUIControl.h>
#include <openvorla/VPxUITableControl.h>
#include <openvorla/VPxVorlaAsciiFilter.h>
#include <openvorla/VPxVorlaAsciiFilterOutput.h>
#include <openvorla/VQuaternion.h>
#include <openvorla/VSelectionList.h>
#include <openvorla/VSelectionMask.h>
#include <openvorla/VStatus.h>
#include <openvorla/VStringArray.h>
#include <openvorla/VSyntax.h>
#include <openvorla/VTimeRange.h>
#include <openvorla/VTransformationMatrix.h>
#include <openvorla/VTypeId.h>

#include <scriptrunner/TapiCast.h>
#include <scriptrunner/TpythonInterpreter.h>
#include <scriptrunner/TpythonLock.h>
#include <scriptrunner/TpythonObjectWithLock.h>
#include <scriptrunner/TstringId.h>

#include <basekit/Tlog.h>

#include <standin/Files.h>
#include <standin/Lifetime.h>
#include <standin/Nodes.h>
#include <standin/Objects.h>
#include <standin/Operation.h>
#include <standin/Plugins.h>
#include <standin/Registry.h>

#include <climits>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <thread>
#include <type_traits>

#include "selftest.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

int gFailures = 0;

}  // namespace

void check(bool ok, const char *what, const char *file, int line) {
  if (ok) return;
  ++gFailures;
  std::fprintf(stderr, "%s:%d: check failed: %s\n", file, line, what);
}

namespace {

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
static_assert(std::is_abstract_v<VPxGeometryData> && std::is_abstract_v<VPxToolCommand>);
static_assert(std::is_abstract_v<VPxControlCommand> &&
              std::is_abstract_v<VPxAnimCurveInterpolator>);

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
    // Outside any operation of the host, only the code is known.
    CHECK(entry.rfind("Python exception in plug-in, in explode:\n"
                      "Traceback (most recent call last):\n",
                      0) == 0);
    CHECK(contains(entry, ", line 2, in explode\n"));
    CHECK(contains(entry, "\nZeroDivisionError: division by zero") && entry.back() != '\n');
    CHECK(!interpreter.catchAndReportException() && Tlog::entries().size() == 1);

    // Inside one: the plug-in and what the host did, and the exception's
    // summary left for the host's failure text.
    standin::Doing computing(nullptr, "compute", [] {
      return standin::Operation::Description{"shapes", "computing 'ring1.area'"};
    });
    PyErr_SetString(PyExc_KeyError, "radius");
    CHECK(interpreter.catchAndReportException());
    CHECK(Tlog::entries().back() ==
          "Python exception in plug-in 'shapes', in compute, computing 'ring1.area':\n"
          "KeyError: 'radius'");
    CHECK(computing.failure() == "KeyError: 'radius'");
    Py_DECREF(globals);
  });
}

// Rotates v about the unit axis by angle (Rodrigues), independently of the
// quaternion code.
VVector rotated(const VVector &v, const VVector &axis, double angle) {
  return v * std::cos(angle) + (axis ^ v) * std::sin(angle) +
         axis * (axis * v) * (1.0 - std::cos(angle));
}

void testRotations() {
  // Right-handed: a quarter turn about z takes x to y.
  VVector turned = VVector(1, 0, 0) * VQuaternion(M_PI / 2, VVector(0, 0, 1)).asMatrix();
  CHECK(turned.isEquivalent(VVector(0, 1, 0)));

  VQuaternion a(0.7, VVector(1, 2, 3)), b(-1.1, VVector(0, 1, -1));
  CHECK((a * b).asMatrix().isEquivalent(a.asMatrix() * b.asMatrix()));
  CHECK(VQuaternion(a.asMatrix()).isEquivalent(a) && VQuaternion(a.asMatrix()).isEquivalent(-a));
  CHECK((a * a.inverse()).isEquivalent(VQuaternion()));

  // Every order decomposes back to the same rotation, at gimbal lock too, and
  // gives back its own angles while the middle one is within (-pi/2, pi/2).
  std::srand(7);
  auto angle = [] { return (std::rand() / double(RAND_MAX) - 0.5) * 6.0; };
  int failures = 0;
  for (int order = VEulerRotation::kXYZ; order <= VEulerRotation::kZYX; ++order)
    for (int n = 0; n < 200; ++n) {
      VEulerRotation e(angle(), angle(), angle(), VEulerRotation::RotationOrder(order));
      if (n % 50 == 0) e.y = e.z = M_PI / 2;
      VEulerRotation back = VEulerRotation::decompose(e.asMatrix(), e.order);
      if (!back.asMatrix().isEquivalent(e.asMatrix(), 1e-9) || back.order != e.order) ++failures;
    }
  CHECK(failures == 0);
  VEulerRotation small(0.3, -0.4, 1.2, VEulerRotation::kYXZ);
  CHECK(
      VEulerRotation::decompose(small.asMatrix(), VEulerRotation::kYXZ).isEquivalent(small, 1e-9));
  // kYXZ rotates about y first: the product of the single-axis matrices.
  VMatrix byHand = VQuaternion(-0.4, VVector(0, 1, 0)).asMatrix() *
                   VQuaternion(0.3, VVector(1, 0, 0)).asMatrix() *
                   VQuaternion(1.2, VVector(0, 0, 1)).asMatrix();
  CHECK(small.asMatrix().isEquivalent(byHand));
  CHECK(small.reorder(VEulerRotation::kZYX).asQuaternion().isEquivalent(small.asQuaternion()));
}

void testTransformationMatrix() {
  const VVector t(1, 2, 3), s(2, 0.5, -1.5), sh(0.2, -0.3, 0.4), spt(0.5, 0, -0.5), rpt(-1, 1, 0);
  const VPoint sp(1, -1, 2), rp(-2, 0.5, 1);
  const VVector axis = VVector(1, 1, 0).normal(), roAxis = VVector(0, 0.6, 0.8);
  const double angle = 0.9, roAngle = -0.4;

  VPxTransformationMatrix m;
  CHECK(m.translateTo(t) == VStatus::kSuccess && m.scaleTo(s) && m.shearTo(sh));
  CHECK(m.rotateTo(VQuaternion(angle, axis)) &&
        m.setRotateOrientation(VQuaternion(roAngle, roAxis), VSpace::kTransform, false));
  CHECK(m.setScalePivot(sp, VSpace::kTransform, false) &&
        m.setRotatePivot(rp, VSpace::kTransform, false));
  CHECK(m.setScalePivotTranslation(spt) && m.setRotatePivotTranslation(rpt));

  CHECK(m.getTranslation() == t && m.getScale() == s && m.getShear() == sh);
  CHECK(m.getRotation().isEquivalent(VQuaternion(angle, axis)));
  CHECK(m.getRotateOrientation(VSpace::kWorld).isEquivalent(VQuaternion(roAngle, roAxis)));
  CHECK(m.getScalePivot() == sp && m.getRotatePivot() == rp);
  CHECK(m.getScalePivotTranslation() == spt && m.getRotatePivotTranslation() == rpt);

  // The composition, point by point: scale and shear about the scale pivot,
  // then orientation and rotation about the rotate pivot, then translation.
  const VPoint p(0.3, -0.7, 1.1);
  VVector v = p.asVector() - sp.asVector();
  v = VVector(v.x * s.x + v.y * s.y * sh.x + v.z * s.z * sh.y, v.y * s.y + v.z * s.z * sh.z,
              v.z * s.z);
  v = v + sp.asVector() + spt - rp.asVector();
  v = rotated(rotated(v, roAxis, roAngle), axis, angle);
  v = v + rp.asVector() + rpt + t;
  VMatrix composed = m.asMatrix();
  CHECK((p * composed).isEquivalent(VPoint(v)));
  CHECK((composed * m.asMatrixInverse()).isEquivalent(VMatrix()));
  CHECK((m.asScaleMatrix() * m.asRotateMatrix())
            .setTranslation(VVector())
            .isEquivalent(VMatrix(composed).setTranslation(VVector())));
  CHECK(m.asMatrix(0.0).isEquivalent(VMatrix()) && m.asMatrix(1.0).isEquivalent(composed));

  // Balanced changes of pivots and orientation leave the matrix as it was.
  VPxTransformationMatrix balanced(m);
  CHECK(balanced.isEquivalent(m) && !balanced.isEquivalent(VPxTransformationMatrix::identity));
  CHECK(balanced.setRotatePivot(VPoint(3, 3, 3)) && balanced.setScalePivot(VPoint(-1, 4, 0)));
  CHECK(balanced.setRotateOrientation(VEulerRotation(0.5, 0.1, -0.2)));
  CHECK(balanced.asMatrix().isEquivalent(composed, 1e-9) &&
        balanced.getRotatePivot() == VPoint(3, 3, 3));
  VPxTransformationMatrix moved(m);
  moved.setRotatePivot(VPoint(3, 3, 3), VSpace::kTransform, false);
  CHECK(!moved.asMatrix().isEquivalent(composed, 1e-6));

  // Decomposition keeps pivots and orientation; a reflection survives.
  VMatrix extra = VEulerRotation(0.2, -0.6, 1.0).asMatrix();
  extra(0, 0) *= -2.0;
  extra.setTranslation(VVector(5, -4, 3));
  VPxTransformationMatrix applied(m);
  CHECK(applied.transformUsing(extra) && applied.asMatrix().isEquivalent(composed * extra, 1e-9));
  CHECK(applied.getRotatePivot() == rp &&
        applied.getRotateOrientation().isEquivalent(VQuaternion(roAngle, roAxis)));
  CHECK(applied.transformUsing(extra, VSpace::kPostTransform) &&
        applied.asMatrix().isEquivalent(extra * composed * extra, 1e-8));
  VPxTransformationMatrix reset;
  CHECK(reset.resetTransformation(composed) && reset.asMatrix().isEquivalent(composed, 1e-9));
  CHECK(reset.getRotatePivot() == VPoint() && reset.getShear() != VVector());
  VMatrix singular;
  singular(1, 1) = 0.0;
  CHECK(reset.resetTransformation(singular) == VStatus::kInvalidParameter &&
        reset.asMatrix().isEquivalent(composed, 1e-9));
  CHECK(reset.resetTransformation() && reset.asMatrix() == VMatrix());
  CHECK(reset.copyValues(&m) && reset.isEquivalent(m, 0.0) && reset.copyValues(nullptr).error());

  // Euler angles read in the matrix's order; changing the order keeps the
  // rotation unless told to keep the angles.
  VPxTransformationMatrix euler;
  CHECK(euler.setRotationOrder(VTransformationMatrix::kZXY));
  CHECK(euler.rotateTo(VEulerRotation(0.1, 0.2, 0.3, VEulerRotation::kZXY)));
  VEulerRotation read = euler.getEulerRotation();
  CHECK(read.order == VEulerRotation::kZXY &&
        read.isEquivalent(VEulerRotation(0.1, 0.2, 0.3, VEulerRotation::kZXY), 1e-9));
  VQuaternion before = euler.getRotation();
  CHECK(euler.setRotationOrder(VTransformationMatrix::kYXZ) &&
        euler.getRotation().isEquivalent(before));
  CHECK(euler.setRotationOrder(VTransformationMatrix::kZXY) &&
        euler.setRotationOrder(VTransformationMatrix::kXYZ, false));
  CHECK(!euler.getRotation().isEquivalent(before, 1e-6) &&
        euler.getEulerRotation().isEquivalent(VEulerRotation(0.1, 0.2, 0.3), 1e-9));
  CHECK(euler.setRotationOrder(VTransformationMatrix::kInvalid) == VStatus::kInvalidParameter);
  CHECK(euler.getRotationOrder() == VTransformationMatrix::kXYZ);

  // Relative changes: about the parent's axes, or the object's own ones.
  VPxTransformationMatrix rel;
  VQuaternion q1(0.4, VVector(0, 0, 1)), q2(0.7, VVector(1, 0, 0));
  rel.rotateTo(q1);
  rel.rotateBy(q2);
  CHECK(rel.getRotation().isEquivalent(q1 * q2));
  rel.rotateTo(q1);
  rel.rotateBy(q2, VSpace::kPostTransform);
  CHECK(rel.getRotation().isEquivalent(q2 * q1));
  rel.translateBy(VVector(1, 0, 0), VSpace::kPostTransform);
  CHECK(rel.getTranslation().isEquivalent(VVector(1, 0, 0) * (q2 * q1).asMatrix()));
  rel.scaleTo(VVector(2, 3, 4));
  rel.scaleBy(VVector(0.5, 2, 1));
  rel.shearBy(VVector(0.1, 0, 0));
  rel.shearBy(VVector(0.1, 0, 0));
  CHECK(rel.getScale() == VVector(1, 6, 4) && rel.getShear().isEquivalent(VVector(0.2, 0, 0)));

  // Refused: invalid spaces and the zero quaternion; nothing changes.
  CHECK(rel.translateTo(VVector(9, 9, 9), VSpace::kInvalid) == VStatus::kInvalidParameter);
  CHECK(rel.scaleTo(VVector(), VSpace::Space(VSpace::kLast)) == VStatus::kInvalidParameter);
  CHECK(rel.rotateTo(VQuaternion(0, 0, 0, 0)) == VStatus::kInvalidParameter);
  CHECK(rel.getScale() == VVector(1, 6, 4) && rel.getRotation().isEquivalent(q2 * q1));

  delete static_cast<VPxTransformationMatrix *>(VPxTransformationMatrix::creator());
}

void testCommandResults() {
  VStatus status;
  VPxCommand::clearResult();
  CHECK(VPxCommand::currentResultType() == VPxCommand::kNoArg);
  CHECK(VPxCommand::currentIntResult(&status) == 0 && status == VStatus::kInvalidParameter);

  VPxCommand::setResult(42);
  CHECK(VPxCommand::currentResultType() == VPxCommand::kLong &&
        !VPxCommand::isCurrentResultArray());
  CHECK(VPxCommand::currentIntResult(&status) == 42 && status);
  CHECK(VPxCommand::currentDoubleResult(&status) == 42.0 && status);
  CHECK(VPxCommand::currentStringResult(&status) == "" && status == VStatus::kInvalidParameter);
  VPxCommand::setResult(true);
  CHECK(VPxCommand::currentIntResult() == 1);
  VPxCommand::setResult(4000000000u);
  CHECK(VPxCommand::currentDoubleResult(&status) == 4000000000.0 && status);
  VPxCommand::setResult(VString("größe ✓"));
  CHECK(VPxCommand::currentStringResult(&status) == "größe ✓" && status);
  CHECK(VPxCommand::currentDoubleResult(&status) == 0.0 && status.error());

  // Appending makes an array; another kind starts a new one.
  VPxCommand::setResult(2.5);
  VPxCommand::appendToResult(3.5);
  VDoubleArray doubles;
  CHECK(VPxCommand::isCurrentResultArray() && VPxCommand::getCurrentResult(doubles));
  CHECK(doubles.length() == 2 && doubles[0] == 2.5 && doubles[1] == 3.5);
  CHECK(VPxCommand::currentDoubleResult(&status) == 0.0 && status == VStatus::kInvalidParameter);
  VPxCommand::appendToResult(VString("a"));
  VPxCommand::appendToResult(VString("b"));
  VStringArray strings;
  CHECK(VPxCommand::getCurrentResult(strings) && strings.length() == 2 && strings[1] == "b");
  CHECK(VPxCommand::getCurrentResult(doubles) == VStatus::kInvalidParameter &&
        doubles.length() == 0);

  VIntArray ints(3, 7);
  ints[1] = -1;
  VPxCommand::setResult(ints);
  VIntArray back;
  CHECK(VPxCommand::getCurrentResult(back) && back == ints);
  CHECK(VPxCommand::getCurrentResult(doubles) && doubles.length() == 3 && doubles[1] == -1.0);
  VPxCommand::setResult(VStringArray());
  CHECK(VPxCommand::isCurrentResultArray() &&
        VPxCommand::currentResultType() == VPxCommand::kString);
  VPxCommand::clearResult();

  Tlog::clear();
  VPxCommand::displayWarning("careful");
  VPxCommand::displayError("broken");
  auto log = Tlog::entries();
  CHECK(log.size() == 2 && log[0] == "Warning: careful" && log[1] == "Error: broken");

  struct PlainCommand : VPxCommand {
    using VPxCommand::hasSyntax;
  } command;
  CHECK(!command.isUndoable() && command.hasSyntax());
  command.setUndoable(true);
  command.setCommandString("doThing -v 1");
  CHECK(command.isUndoable() && command.commandString() == "doThing -v 1");
  CHECK(command.doIt(VArgList()) == VStatus::kNotImplemented);
}

void testArgumentsAndSyntax() {
  VArgList args;
  args.addArg("-v").addArg(3).addArg(2.5).addArg(true).addArg("42").addArg("On").addArg("x").addArg(
      0.1);
  CHECK(args.length() == 8);
  VStatus status;
  CHECK(args.asString(0, &status) == "-v" && status);
  CHECK(args.asString(1) == "3" && args.asString(2) == "2.5" && args.asString(3) == "true");
  CHECK(args.asString(7) == "0.1" &&
        VArgList().addArg(0.1 + 0.2).asString(0) == "0.30000000000000004");
  CHECK(args.asInt(4, &status) == 42 && status && args.asDouble(1) == 3.0);
  CHECK(args.asInt(2, &status) == 0 && status == VStatus::kInvalidParameter);
  CHECK(args.asBool(5, &status) && status && args.asBool(1));
  CHECK(!args.asBool(6, &status) && status == VStatus::kInvalidParameter);
  CHECK(args.asDouble(6, &status) == 0.0 && status.error());
  CHECK(args.asString(8, &status) == "" && status == VStatus::kInvalidParameter);
  VArgList big;
  big.addArg(1.0e12).addArg("99999999999");
  CHECK(big.asInt(0, &status) == 0 && status.error() && big.asInt(1, &status) == 0 &&
        status.error());
  CHECK(args.flagIndex("-x", "-v") == 0 && args.flagIndex("-q") == VArgList::kInvalidArgIndex);

  VSyntax syntax;
  CHECK(syntax.addFlag("-v", "-verbose") &&
        syntax.addFlag("-n", "-name", VSyntax::kString, VSyntax::kLong));
  CHECK(syntax.addFlag("-v", "-value") == VStatus::kInvalidParameter);
  CHECK(syntax.addFlag("n", "-number") == VStatus::kInvalidParameter);
  CHECK(syntax.numberOfFlags() == 2 && syntax.numberOfFlagArgs("-name") == 2);
  CHECK(syntax.flagArgType("-n", 1) == VSyntax::kLong &&
        syntax.flagArgType("-n", 2) == VSyntax::kInvalidArgType);
  CHECK(syntax.setMinObjects(2) && syntax.setMaxObjects(1) == VStatus::kInvalidParameter);
}

void testPlugins() {
  standin::unloadAllPlugins();
  VObject object = standin::loadPlugin("rigTools", "/plug-ins/rig");
  VStatus status;
  VFnPlugin plugin(object, "Studio", "2.1", "Any", &status);
  CHECK(status && plugin.object() == object);
  CHECK(plugin.name() == "rigTools" && plugin.vendor() == "Studio" && plugin.version() == "2.1");
  CHECK(plugin.loadPath() == "/plug-ins/rig" && plugin.apiVersion() == "Any");
  VFnPlugin again(object);  // defaults do not overwrite what was recorded
  CHECK(again.vendor() == "Studio" && again.setVersion("2.2") && plugin.version() == "2.2");

  VObject null;
  VFnPlugin detached(null, "X", "1", "Any", &status);
  CHECK(status == VStatus::kInvalidParameter && detached.object().isNull());
  CHECK(detached.setName("any") == VStatus::kFailure && detached.name() == "");

  VObject other = standin::loadPlugin("meshTools", "/plug-ins/mesh");
  VFnPlugin second(other);
  status = second.setName("rigTools", false);
  CHECK(status == VStatus::kFailure && second.name() == "meshTools");
  CHECK(status.errorString() == "The plug-in name 'rigTools' is already in use");
  CHECK(second.setName("rigTools") && second.name() == "rigTools1");
  CHECK(second.setName("rigTools") && second.name() == "rigTools1");  // its own name is free to it
  CHECK(VFnPlugin::findPlugin("rigTools1") == other && VFnPlugin::findPlugin("meshTools").isNull());
  CHECK(plugin.setName("rigTools", false) && plugin.name() == "rigTools");
  CHECK(standin::loadPlugin("rigTools", "") != object &&
        VFnPlugin::findPlugin("rigTools2").apiType() == VFn::kPlugin);

  VFnPlugin::setRegisteringCallableScript();
  CHECK(VFnPlugin::registeringCallableScript() && !VFnPlugin::registeringCallableScript());
  CHECK(!VFnPlugin::isNodeRegistered("rigNode"));
  CHECK(VPxNode::inheritAttributesFrom("rigNode") == VStatus::kInvalidParameter);

  VString box("openRigOptions");
  VStringArray items = plugin.addMenuItem("rig", "mainMenu", "rigCommand", "", true, &box, &status);
  CHECK(status && items.length() == 2 && items[0] == "rig" && items[1] == "rigOption");
  items =
      second.addMenuItem("rig", "Rig…", "mainMenu", "rigCommand", "-all", false, nullptr, &status);
  CHECK(status && items.length() == 1 && items[0] == "rig1");
  plugin.addMenuItem("bad", "mainMenu", "cmd", "", true, nullptr, &status);
  CHECK(status == VStatus::kInvalidParameter);
  VStringArray remove;
  remove.append("rig");
  remove.append("rig1");  // the other plug-in's
  // Each plug-in removes only its own items; the names it did not find stay.
  CHECK(plugin.removeMenuItem(remove) == VStatus::kInvalidParameter);
  CHECK(remove.length() == 1 && remove[0] == "rig1");
  CHECK(second.removeMenuItem(remove) && remove.length() == 0);
  CHECK(plugin.addMenuItem("rig", "mainMenu", "c", "", false)[0] == "rig");

  PyObject *procs = reinterpret_cast<PyObject *>(&status);  // never dereferenced
  CHECK(plugin.registerUI(procs, nullptr) == VStatus::kInvalidParameter);
  CHECK(plugin.registerUI(procs, procs) && plugin.registerUI(procs, procs) == VStatus::kFailure);
  CHECK(plugin.registerDisplayFilter("rigs", "Rigs", "drawdb") &&
        second.registerDisplayFilter("rigs", "Rigs", "") == VStatus::kInvalidParameter);
  VPluginCallableInfo info("rigNode", "creator");
  plugin.setCallableInfo(&info);
  CHECK(again.getCallableInfo() == &info && second.getCallableInfo() == nullptr);

  standin::unloadPlugin(object);
  CHECK(plugin.name() == "" && plugin.setVersion("3") == VStatus::kFailure);
  CHECK(VFnPlugin::findPlugin("rigTools").isNull());
  standin::unloadAllPlugins();
}

void testNodesAndData() {
  VPxNode node;
  VPlug plug(standin::makeObject(VFn::kDependencyNode, "blend1"), standin::makeAttribute("weight"));
  VDataBlock block;
  CHECK(node.compute(plug, block) == VStatus::kUnknownParameter &&
        node.internalArrayCount(plug, VDGContext()) == -1);
  CHECK(node.thisVObject().isNull() && node.existWithoutInConnections() && !node.doNotWrite());
  standin::setNodeIdentity(node, plug.node(), "blend", VTypeId(0x80001));
  CHECK(node.name() == "blend1" && node.typeName() == "blend" && node.typeId() == VTypeId(0x80001));
  CHECK(plug.name() == "blend1.weight" &&
        plug.elementByLogicalIndex(3).name() == "blend1.weight[3]");

  standin::beginNodeType();
  VObject input = standin::makeAttribute("input"), output = standin::makeAttribute("output");
  CHECK(VPxNode::addAttribute(input) && VPxNode::addAttribute(output));
  CHECK(VPxNode::addAttribute(input) == VStatus::kInvalidParameter);
  CHECK(VPxNode::addAttribute(plug.node()) == VStatus::kInvalidParameter);
  CHECK(VPxNode::attributeAffects(VPlug(VObject(), input), VPlug(VObject(), output)));
  CHECK(standin::nodeTypeAffects(input, output) && !standin::nodeTypeAffects(output, input));
  CHECK(VPxNode::removeAttribute(input) && !standin::nodeTypeAffects(input, output));
  CHECK(standin::nodeTypeAttributeCount() == 1 && VPxNode::removeAttribute(input).error());

  // Handles share the block's value; a copy of the block shares it too.
  VStatus status;
  VDataHandle out = block.outputValue(output, &status);
  CHECK(status && !out.isNull() && !block.isClean(output));
  out.setDouble(2.75);
  VDataBlock copy(block);
  CHECK(copy.inputValue(output).asDouble() == 2.75 && copy.inputValue(output).asInt() == 2);
  CHECK(block.setClean(output) && copy.isClean(output));
  VPlug element = VPlug(VObject(), output).elementByLogicalIndex(1);
  block.outputValue(element).setString("text");
  CHECK(block.inputValue(element).asString() == "text" &&
        block.inputValue(element).asDouble() == 0.0);
  CHECK(block.inputValue(output).asDouble() == 2.75 && !block.isClean(element));
  CHECK(block.inputValue(VObject(), &status).isNull() && status == VStatus::kInvalidParameter);
}

void testMatricesAndPoints() {
  double values[4][4] = {{2, 1, 0, 0}, {0, 3, 1, 0}, {1, 0, 4, 0}, {5, -2, 7, 1}};
  VMatrix m(values);
  CHECK(std::fabs(m.det4x4() - 25.0) < 1e-12 && std::fabs(m.det3x3() - 25.0) < 1e-12);
  CHECK((m * m.inverse()).isEquivalent(VMatrix()) && (m.inverse() * m).isEquivalent(VMatrix()));
  CHECK(m.transpose()(3, 0) == 0.0 && m.transpose()(0, 3) == 5.0 && !m.isSingular());
  double out[4][4];
  m.get(out);
  CHECK(out[3][2] == 7.0 && m.translation() == VVector(5, -2, 7));
  // A pivoting row swap is needed: the leading entry is zero.
  double swapped[4][4] = {{0, 1, 0, 0}, {1, 0, 0, 0}, {0, 0, 1, 0}, {0, 0, 0, 1}};
  CHECK((VMatrix(swapped) * VMatrix(swapped).inverse()).isEquivalent(VMatrix()));
  double flat[4][4] = {{1, 2, 3, 0}, {2, 4, 6, 0}, {0, 0, 1, 0}, {0, 0, 0, 1}};
  CHECK(VMatrix(flat).isSingular() && VMatrix(flat).inverse() == VMatrix());

  // Points carry translation, vectors do not; w scales the cartesian point.
  CHECK((VPoint(1, 1, 1) * m).isEquivalent(VPoint(8, 2, 12)));
  CHECK((VVector(1, 1, 1) * m).isEquivalent(VVector(3, 4, 5)));
  VPoint h(2, 4, 6, 2);
  CHECK(h.isEquivalent(VPoint(1, 2, 3)) && (h + VVector(1, 0, 0)).isEquivalent(VPoint(2, 2, 3)));
  CHECK(h.cartesianize() && h == VPoint(1, 2, 3, 1));
  VPoint infinite(1, 0, 0, 0);
  CHECK(infinite.cartesianize() == VStatus::kInvalidParameter && infinite.w == 0.0);
  CHECK(VPoint(4, 6, 3) - VPoint(1, 2, 3) == VVector(3, 4, 0) &&
        VPoint().distanceTo(VPoint(3, 4)) == 5.0);
  VVector zero;
  CHECK(zero.normalize() == VStatus::kInvalidParameter &&
        (VVector(1, 0, 0) ^ VVector(0, 1, 0)) == VVector(0, 0, 1));

  // Interpolation keeps to the short arc and the axis.
  VQuaternion quarter(M_PI / 2, VVector(0, 0, 1));
  VQuaternion eighth = VQuaternion::slerp(VQuaternion(), -quarter, 0.5);
  CHECK(eighth.isEquivalent(VQuaternion(M_PI / 4, VVector(0, 0, 1))));
  VVector axis;
  double angle = 0;
  CHECK(VQuaternion(1.25, VVector(0, 3, 4)).getAxisAngle(axis, angle) &&
        std::fabs(angle - 1.25) < 1e-12);
  CHECK(axis.isEquivalent(VVector(0, 0.6, 0.8)) && !VQuaternion().getAxisAngle(axis, angle));

  // Equal matrices from different components: equivalent but not equal.
  VTransformationMatrix a, b;
  a.setRotation(VQuaternion(0.5, VVector(0, 1, 0)));
  b = a;
  b.setRotatePivot(VPoint(1, 2, 3));
  CHECK(a.isEquivalent(b) && a != b);
  CHECK(VTransformationMatrix(VMatrix(flat)) == VTransformationMatrix());
  a.setTranslation(VVector(4, 0, 0));
  CHECK(a.asMatrix(0.5).isEquivalent(
      VQuaternion(0.25, VVector(0, 1, 0)).asMatrix().setTranslation(VVector(2, 0, 0))));
}

void testTimesAndEvaluation() {
  CHECK(VTime(48, VTime::kFilm) == VTime(2, VTime::kSeconds) &&
        VTime(1, VTime::kMinutes) > VTime(59));
  CHECK(std::fabs(VTime(1, VTime::kNTSCFrame).as(VTime::kMilliseconds) - 1000.0 / 30) < 1e-9);
  CHECK(VTime(3, VTime::kInvalid).as(VTime::kSeconds) == 0.0);
  VTimeRange range(VTime(1), VTime(25, VTime::kFilm));
  CHECK(!range.isEmpty() && range.contains(VTime(24, VTime::kFilm)) && !range.contains(VTime(2)));
  CHECK(VTimeRange().isEmpty() && VTimeRange(VTime(5), VTime(4)) == VTimeRange() &&
        range != VTimeRange());
  VPxNode node;
  CHECK(node.transformInvalidationRange(VPlug(), range) == range);
  CHECK(VDGContext().isNormal() && !VDGContext(VTime(2)).isNormal());
  CHECK(VDGContext(VTime(48, VTime::kFilm)) == VDGContext(VTime(2)) &&
        VDGContext() != VDGContext(VTime()));

  VObject weights = standin::makeAttribute("weights");
  VObject graphNode = standin::makeObject(VFn::kDependencyNode, "skin1");
  VPlugArray dirty;
  dirty.append(VPlug(graphNode, weights).elementByLogicalIndex(4));
  CHECK(dirty.set(VPlug(), 1) == VStatus::kInvalidParameter && dirty.length() == 1);
  VEvaluationNode evaluation(graphNode, dirty);
  VStatus status;
  CHECK(evaluation.dirtyPlugExists(weights) && !evaluation.dirtyPlugExists(VPxNode::state));
  CHECK(evaluation.dependencyNode(&status) == graphNode && status);
  CHECK(VEvaluationNode().dependencyNode(&status).isNull() && status == VStatus::kInvalidParameter);

  VCacheSchema schema;
  CHECK(schema.add(weights) && schema.add(weights) && schema.length() == 1);
  CHECK(schema.add(graphNode) == VStatus::kInvalidParameter && schema.contains(weights));
  VNodeCacheSetupInfo setup;
  setup.setPreference(VNodeCacheSetupInfo::kWantToCacheByDefault, true);
  setup.setPreference(VNodeCacheSetupInfo::kPreferenceLast, true);
  CHECK(setup.getPreference(VNodeCacheSetupInfo::kWantToCacheByDefault) &&
        !setup.getPreference(VNodeCacheSetupInfo::kPreferenceLast));
}

// The context forms of the internal-value queries reach the plain forms that
// a node overrides.
class CountingNode : public VPxNode {
 public:
  bool getInternalValue(const VPlug &, VDataHandle &handle) override {
    handle.setInt(++calls);
    return true;
  }
  int calls = 0;
};

void testNodeOverrides() {
  CountingNode node;
  VDataBlock block;
  VObject attribute = standin::makeAttribute("count");
  VDataHandle handle = block.outputValue(attribute);
  VDGContext context(VTime(3));
  VPxNode &base = node;
  CHECK(base.getInternalValueInContext(VPlug(), handle, context) && node.calls == 1);
  CHECK(block.inputValue(attribute).asInt() == 1);
  CHECK(!base.setInternalValueInContext(VPlug(), handle, context));

  VObject notPlugin = standin::makeObject(VFn::kDependencyNode, "plain");
  VStatus status;
  VFnPlugin plugin(notPlugin, "V", "1", "Any", &status);
  CHECK(status == VStatus::kInvalidParameter && plugin.object().isNull() && plugin.vendor() == "");

  VPxTransformationMatrix moved;
  moved.translateTo(VVector(1, 2, 3));
  VPxTransformationMatrix assigned;
  assigned = moved;
  CHECK(assigned.getTranslation() == VVector(1, 2, 3));
  CHECK(VPxTransformationMatrix::identity.asMatrix() == VMatrix());
}

void testGeometryValues() {
  VBoundingBox box;
  CHECK(box.isEmpty() && !box.contains(VPoint()) && box == VBoundingBox());
  box.expand(VPoint(1, -2, 3));
  CHECK(!box.isEmpty() && box.contains(VPoint(1, -2, 3)) && box.width() == 0.0);
  box.expand(VBoundingBox());
  box.expand(VPoint(2, 4, 6, 2));  // the cartesian point (1, 2, 3)
  CHECK(box.min() == VPoint(1, -2, 3) && box.max() == VPoint(1, 2, 3) && box.height() == 4.0);
  VBoundingBox cube(VPoint(1, 1, 1), VPoint(-1, -1, -1));
  CHECK(cube.min() == VPoint(-1, -1, -1) && cube.center() == VPoint());
  CHECK(cube.intersects(VBoundingBox(VPoint(1, 1, 1), VPoint(2, 2, 2))));
  CHECK(!cube.intersects(VBoundingBox(VPoint(1.5, 0, 0), VPoint(2, 1, 1))) &&
        cube.intersects(VBoundingBox(VPoint(1.5, 0, 0), VPoint(2, 1, 1)), 0.5));
  // A quarter turn about z, then a move: the box around the moved corners.
  VMatrix turn = VQuaternion(M_PI / 2, VVector(0, 0, 1)).asMatrix();
  turn.setTranslation(VVector(10, 0, 0));
  VBoundingBox moved(VPoint(0, 0, 0), VPoint(2, 1, 1));
  moved.transformUsing(turn);
  CHECK(moved.min().isEquivalent(VPoint(9, 0, 0)) && moved.max().isEquivalent(VPoint(10, 2, 1)));
  cube.clear();
  CHECK(cube.isEmpty() && !cube.intersects(moved, 100.0));

  VSelectionMask mask(VSelectionMask::kSelectMeshes);
  VStatus status;
  CHECK(mask.addMask(VSelectionMask::kSelectVertices) &&
        mask.addMask(VSelectionMask::kLast) == VStatus::kInvalidParameter);
  CHECK(mask.intersects(VSelectionMask::kSelectVertices) &&
        !mask.intersects(VSelectionMask::kSelectEdges));
  CHECK(!mask.intersects(static_cast<VSelectionMask::SelectionType>(-1), &status) &&
        status == VStatus::kInvalidParameter);
  CHECK((VSelectionMask(VSelectionMask::kSelectEdges) | mask)
            .intersects(VSelectionMask::kSelectEdges));
  CHECK(VSelectionMask(VSelectionMask::kLast).isEmpty() && !mask.intersects(VSelectionMask()));

  VObject a = standin::makeObject(VFn::kDagNode, "a"), b = standin::makeObject(VFn::kDagNode, "b");
  VSelectionList list;
  CHECK(list.add(a) && list.add(b) && list.add(a) && list.length() == 2);
  VObject first;
  CHECK(list.add(a, false) && list.getDependNode(0, first) && first == b);
  CHECK(list.add(VObject()) == VStatus::kInvalidParameter &&
        list.getDependNode(2, first) == VStatus::kInvalidParameter);
  VSelectionList other;
  other.add(standin::makeObject(VFn::kDagNode, "c"));
  other.add(b);
  CHECK(list.merge(other) && list.length() == 3 && list.remove(3) == VStatus::kInvalidParameter);

  VDagPath path;
  CHECK(!path.isValid() && path.fullPathName(&status) == "" && status.error());
  CHECK(path.push(a) && path.push(b) && path.push(VObject()) == VStatus::kInvalidParameter);
  CHECK(path.fullPathName() == "|a|b" && path.partialPathName() == "b" && path.node() == b);
  CHECK(path.pop(3) == VStatus::kInvalidParameter && path.pop() && path.fullPathName() == "|a");
}

void testDeviceValues() {
  VDeviceState state(2, 1);
  CHECK(!state.isNull() && VDeviceState().isNull() && state.maxAxis() == 2);
  CHECK(state.setDevicePosition(-40, 1) && state.devicePosition(1) == -40);
  CHECK(state.setDevicePosition(5, 2) == VStatus::kInvalidParameter &&
        state.devicePosition(2) == 0);
  CHECK(state.setButtonState(true, 0) && state.buttonState(0) && !state.buttonState(7) &&
        state.setButtonState(true, 1) == VStatus::kInvalidParameter);

  VEvent event(12, -3, VEvent::kRightMouse, VEvent::kShiftKey | VEvent::kAltKey);
  short x = 0, y = 0;
  CHECK(event.getPosition(x, y) && x == 12 && y == -3);
  CHECK(event.isModifierShift() && event.isModifierAlt() && !event.isModifierControl());
  CHECK(event.setMouseButton(static_cast<VEvent::MouseButtonType>(3)) ==
            VStatus::kInvalidParameter &&
        event.mouseButton() == VEvent::kRightMouse);

  VFileObject file;
  CHECK(!file.isSet() && file.setRawFullName("/scenes/shot 1/rig.v1.va"));
  CHECK(file.rawPath() == "/scenes/shot 1/" && file.rawName() == "rig.v1.va" &&
        file.extension() == "va" && file.isSet());
  CHECK(file.setRawName("a/b") == VStatus::kInvalidParameter && file.rawName() == "rig.v1.va");
  CHECK(file.setRawPath("/tmp") && file.rawFullName() == "/tmp/rig.v1.va");
  file.setRawFullName("README");
  CHECK(file.rawPath() == "" && file.extension() == "");
}

// A transform whose matrix is made through its own creator, with the x
// translation locked.
class LockedTransform : public VPxTransform {
 public:
  VPxTransformationMatrix *createTransformationMatrix() override {
    ++made;
    return new VPxTransformationMatrix();
  }
  int made = 0;

 protected:
  VVector applyTranslationLocks(const VVector &toTest, const VVector &saved,
                                VStatus *ReturnStatus) override {
    if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
    return VVector(saved.x, toTest.y, toTest.z);
  }
};

void testTransform() {
  standin::resetCounts();
  {
    LockedTransform transform;
    CHECK(transform.made == 0 && transform.type() == VPxNode::kTransformNode);
    VPxTransformationMatrix &matrix = transform.transformationMatrix();
    CHECK(transform.made == 1 && &transform.transformationMatrix() == &matrix &&
          transform.transformationMatrixPtr() == &matrix);
    CHECK(transform.translateTo(VVector(1, 2, 3)) && matrix.getTranslation() == VVector(1, 2, 3));
    CHECK(transform.getTranslation(VSpace::kTransform, VDGContext(VTime(4))) == VVector(1, 2, 3));
    CHECK(transform.getMatrix().translation() == VVector(1, 2, 3));

    // Locks first, then limits: x keeps its value, y is clamped.
    VDataBlock block;
    CHECK(transform.setLimit(VFnTransform::kTranslateMaxY, 1.5) &&
          transform.enableLimit(VFnTransform::kTranslateMaxY, true));
    CHECK(transform.checkAndSetTranslation(block, VPlug(), VVector(9, 9, 9), VSpace::kTransform));
    CHECK(transform.getTranslation() == VVector(1, 1.5, 9));
    CHECK(transform.setLimit(VFnTransform::kTranslateMinY, 2.0) == VStatus::kInvalidParameter &&
          transform.limitValue(VFnTransform::kTranslateMinY) == -1.0);
    CHECK(transform.limitValue(VFnTransform::kRotateMaxZ) == 2 * M_PI &&
          !transform.isLimited(VFnTransform::kRotateMaxZ));
    VStatus status;
    CHECK(!transform.isLimited(static_cast<VFnTransform::LimitType>(18), &status) &&
          status == VStatus::kInvalidParameter);
    CHECK(transform.setLimit(VFnTransform::kRotateMinX, -1.0) &&
          transform.enableLimit(VFnTransform::kRotateMinX, true));
    CHECK(transform.checkAndSetRotation(block, VPlug(), VEulerRotation(-1.4, 0.5, 0),
                                        VSpace::kTransform));
    CHECK(transform.getEulerRotation().isEquivalent(VEulerRotation(-1.0, 0.5, 0), 1e-9));
    CHECK(transform.clearLimits() && !transform.isLimited(VFnTransform::kTranslateMaxY));

    VPxTransformationMatrix other;
    CHECK(transform.computeLocalTransformation(&other, block) &&
          other.getTranslation() == VVector(1, 1.5, 9));
    CHECK(transform.computeLocalTransformation(nullptr, block) == VStatus::kInvalidParameter);
    transform.resetTransformation(block);
    CHECK(transform.getTranslation() == VVector() && !transform.isBounded() &&
          transform.boundingBox().isEmpty());
  }
  CHECK(standin::aliveCount("VPxTransformationMatrix") == 0);
  CHECK(VPxTransform::isNonAffineMatricesEnabled() &&
        VPxTransform::setNonAffineMatricesEnabled(false) &&
        !VPxTransform::isNonAffineMatricesEnabled());
  VPxTransform::setNonAffineMatricesEnabled(true);
}

class PlainGeometry : public VPxGeometryData {
 public:
  void copy(const VPxData &) override { ++copies; }
  VTypeId typeId() const override { return VTypeId(0x80100); }
  VString name() const override { return "plainGeometry"; }
  int copies = 0;
};

class PlainInterpolator : public VPxAnimCurveInterpolator {
 public:
  double evaluate(const VTime &time) override { return time.as(VTime::kSeconds); }
};

// An iterator that lets the test reach what derived iterators use.
class OpenIterator : public VPxGeometryIterator {
 public:
  using VPxGeometryIterator::geometry;
  using VPxGeometryIterator::object;
  using VPxGeometryIterator::setMaxPoints;
  using VPxGeometryIterator::VPxGeometryIterator;
};

void testGeometryAndShapes() {
  VObjectArray components;
  int data = 0;
  OpenIterator it(&data, components);
  CHECK(it.geometry() == &data && it.isDone() && it.next() == VStatus::kFailure);
  CHECK(it.setMaxPoints(3) && it.setMaxPoints(-1) == VStatus::kInvalidParameter);
  VPoint point;
  CHECK(it.setPointGetNext(point) == 0 && it.index() == 1 && it.next() && it.next());
  CHECK(it.isDone() && it.reset() && it.currentPoint() == 0 && it.iteratorCount() == 3);

  PlainGeometry geometry, source;
  VMatrix matrix;
  geometry.smartCopy(nullptr);
  geometry.smartCopy(&source);
  CHECK(geometry.copies == 1 && !geometry.matrix(matrix));
  matrix.setTranslation(VVector(0, 1, 0));
  geometry.setMatrix(matrix);
  VMatrix read;
  CHECK(geometry.matrix(read) && read == matrix);
  VObject component;
  CHECK(geometry.iterator(components, component, true) == nullptr);

  VPxSurfaceShape shape;
  CHECK(shape.type() == VPxNode::kSurfaceShape &&
        shape.geometryIteratorSetup(components, component) == nullptr);
  CHECK(shape.match(VSelectionMask::kSelectPluginShapes, components));
  components.append(standin::makeObject(VFn::kData, "vtx[0]"));
  CHECK(!shape.match(VSelectionMask::kSelectPluginShapes, components));
  CHECK(it.setObject(shape) && it.object() == &shape);

  PlainInterpolator interpolator;
  interpolator.initialize(VObject(), 0);
  CHECK(interpolator.evaluate(VTime(12, VTime::kFilm)) == 0.5);
}

// A translator with an extension, and a filter that adds text at its hooks.
class RigTranslator : public VPxFileTranslator {
 public:
  VString defaultExtension() const override { return "rig"; }
};

class NotingFilter : public VPxVorlaAsciiFilter {
 public:
  bool writesRequirements() const override { return requirements; }
  VStatus writePostHeader(VPxVorlaAsciiFilterOutput &out) override {
    seenFile = file().rawName();
    out << "// by " << 2 << " filters, " << 0.1 << "\n";
    return VStatus::kSuccess;
  }
  VStatus writePreTrailer(VPxVorlaAsciiFilterOutput &out) override {
    out.write("// trailer\n");
    return failTrailer ? VStatus(VStatus::kFailure) : VStatus(VStatus::kSuccess);
  }
  bool requirements = true;
  bool failTrailer = false;
  VString seenFile;
  using VPxVorlaAsciiFilter::file;
};

// A C++ plug-in's classes and callbacks, as the registry makes and calls them.
int gInitializations = 0;
void *makeNode() { return new CountingNode; }
void *makeNothing() { return nullptr; }
void *makeCommand() { return new VPxCommand; }
void *makeData() { return new PlainGeometry; }
VStatus initNode() {
  ++gInitializations;
  // The host starts the type's declarations afresh before its initializer.
  return standin::nodeTypeAttributeCount() == 0 ? VStatus::kSuccess : VStatus::kFailure;
}
VSyntax makeSyntax() { return VSyntax(); }
VPxTransformationMatrix *makeMatrix() { return new VPxTransformationMatrix; }

const standin::RegistrationInfo *findRegistration(const std::vector<standin::RegistrationInfo> &all,
                                                  const char *name) {
  for (const standin::RegistrationInfo &r : all)
    if (r.name == name) return &r;
  return nullptr;
}

void testRegistry() {
  standin::unloadAllPlugins();
  VObject rigObject = standin::loadPlugin("rig", "/plug-ins/rig");
  VObject meshObject = standin::loadPlugin("mesh", "/plug-ins/mesh");
  VFnPlugin rig(rigObject), mesh(meshObject);

  CHECK(rig.registerNode("rigNode", VTypeId(0x100), makeNode, initNode));
  CHECK(VFnPlugin::isNodeRegistered("rigNode") && !VFnPlugin::isNodeRegistered("meshNode"));
  VStatus status = mesh.registerNode("rigNode", VTypeId(0x101), makeNode, initNode);
  CHECK(status == VStatus::kFailure &&
        status.errorString() == "The name 'rigNode' is in use by the node type 'rigNode'");
  // Node and data types share their names and type ids.
  status = mesh.registerData("meshData", VTypeId(0x100), makeData);
  CHECK(status == VStatus::kFailure &&
        status.errorString() == "The type id 0x100 is in use by the node type 'rigNode'");
  CHECK(mesh.registerData("meshData", VTypeId(0x102), makeData, VPxData::kGeometryData));
  status = mesh.registerNode("", VTypeId(0x103), makeNode, initNode);
  CHECK(status == VStatus::kInvalidParameter && status.errorString() == "A node type needs a name");
  status = mesh.registerNode("meshNode", VTypeId(0x103), makeNode, nullptr);
  CHECK(status == VStatus::kInvalidParameter &&
        status.errorString() == "The node type 'meshNode' needs an initializer");
  CHECK(mesh.registerNode("meshNode", VTypeId(), makeNode, initNode) == VStatus::kInvalidParameter);
  CHECK(rig.registerTransform("rigXform", VTypeId(0x104), makeNode, initNode, makeMatrix,
                              VTypeId(0x105)));
  CHECK(mesh.registerShape("meshShape", VTypeId(0x106), makeNode, initNode));
  CHECK(rig.matrixTypeIdFromXformId(VTypeId(0x104)) == VTypeId(0x105) &&
        mesh.matrixTypeIdFromXformId(VTypeId(0x104)) == VTypeId());

  // Commands of every kind share names, a context's tool command included.
  CHECK(rig.registerCommand("rigCmd", makeCommand, makeSyntax));
  CHECK(rig.registerContextCommand("rigCtx", makeNothing, "rigTool", makeCommand, nullptr));
  status = mesh.registerControlCommand("rigTool", makeNothing);
  CHECK(status == VStatus::kFailure &&
        status.errorString() == "The name 'rigTool' is in use by the context command 'rigCtx'");
  status = mesh.registerContextCommand("meshCtx", makeNothing, "rigCmd", makeCommand, nullptr);
  CHECK(status.errorString() == "The name 'rigCmd' is in use by the command 'rigCmd'");
  CHECK(mesh.registerContextCommand("meshCtx", makeNothing, "meshTool", nullptr, nullptr) ==
        VStatus::kInvalidParameter);
  // Kinds outside the shared namespaces keep their own; ids unique among their kind.
  CHECK(rig.registerDevice("rigCmd", makeNothing) &&
        rig.registerEvaluator("e", 7, nullptr) == VStatus::kInvalidParameter);
  CHECK(rig.registerAnimCurveInterpolator("smooth", 3, makeNothing));
  CHECK(mesh.registerAnimCurveInterpolator("steps", 3, makeNothing) == VStatus::kFailure);

  auto all = standin::registrations();
  const standin::RegistrationInfo *ctx = findRegistration(all, "rigCtx");
  CHECK(all.size() == 8 && ctx && ctx->kind == "ContextCommand" && ctx->plugin == "rig" &&
        ctx->secondName == "rigTool" && ctx->scriptCallables() == 0);
  // In argument order, the absent syntax creator left out.
  CHECK(ctx && ctx->callbacks.size() == 2 && ctx->callbacks[1].role == "tool command creator" &&
        !ctx->callbacks[1].script);
  const standin::RegistrationInfo *data = findRegistration(all, "meshData");
  CHECK(data && data->typeId == 0x102 && data->flags == VPxData::kGeometryData);
  CHECK(mesh.setName("meshTools") &&
        findRegistration(standin::registrations(), "meshData")->plugin == "meshTools");

  // The application makes instances through the registered creators.
  standin::resetCounts();
  VPxNode *node = standin::createNode("rigXform");
  CHECK(node && node->typeName() == "rigXform" && node->typeId() == VTypeId(0x104));
  CHECK(node && node->thisVObject().apiType() == VFn::kTransform);
  standin::deleteNode(node);
  CHECK(standin::constructedCount("VPxNode") == 1 && standin::aliveCount("VPxNode") == 0);
  standin::beginNodeType();
  CHECK(VPxNode::addAttribute(standin::makeAttribute("leftOver")));
  gInitializations = 0;
  CHECK(standin::initializeNode("meshShape") && gInitializations == 1);
  CHECK(standin::initializeNode("meshData") == VStatus::kInvalidParameter);
  VPxCommand *command = standin::createCommand("rigTool");
  CHECK(command && standin::aliveCount("VPxCommand") == 1 && !standin::createCommand("rigCtx"));
  standin::deleteCommand(command);
  VPxData *made = standin::createData(VTypeId(0x102));
  CHECK(made && made->name() == "plainGeometry" && !standin::createData(VTypeId(0x100)));
  standin::deleteData(made);
  CHECK(standin::aliveCount("VPxData") == 0);

  // Only the plug-in that registered something deregisters it, by its own kind.
  status = mesh.deregisterNode(VTypeId(0x100));
  CHECK(status == VStatus::kFailure &&
        status.errorString() == "The node type 'rigNode' was registered by another plug-in");
  status = rig.deregisterCommand("rigCtx");
  CHECK(status == VStatus::kInvalidParameter &&
        status.errorString() == "The context command 'rigCtx' is not a command");
  status = rig.deregisterNode(VTypeId(0x102));
  CHECK(status.errorString() == "The data type 'meshData' is not a node type");
  status = rig.deregisterCommand("nothing");
  CHECK(status == VStatus::kFailure &&
        status.errorString() == "No command named 'nothing' is registered");
  CHECK(rig.deregisterContextCommand("rigCtx", "otherTool") == VStatus::kInvalidParameter);
  CHECK(rig.deregisterContextCommand("rigCtx", "rigTool") && !standin::createCommand("rigTool"));
  CHECK(mesh.registerControlCommand("rigTool", makeNothing));
  CHECK(mesh.deregisterNode(VTypeId(0x106)) && !VFnPlugin::isNodeRegistered("meshShape"));
  CHECK(rig.deregisterNode(VTypeId(0x106)) == VStatus::kFailure);

  // A render pass implementation replaces another only when asked to.
  CHECK(rig.registerRenderPassImpl("beauty", nullptr, makeNothing));
  CHECK(mesh.registerRenderPassImpl("beauty", nullptr, makeNothing) == VStatus::kFailure);
  CHECK(mesh.registerRenderPassImpl("beauty", nullptr, makeNothing, true));
  all = standin::registrations();
  CHECK(findRegistration(all, "beauty")->plugin == "meshTools");

  VStringArray extensions;
  CHECK(rig.registerImageFile("pic", makeNothing, extensions) == VStatus::kInvalidParameter);
  extensions.append("pic");
  CHECK(rig.registerImageFile("pic", makeNothing, extensions));
  CHECK(findRegistration(standin::registrations(), "pic")->flags == 10);
  CHECK(rig.registerFileTranslator("rigFile", nullptr, makeNothing));
  CHECK(findRegistration(standin::registrations(), "rigFile")->secondName == "default");
  CHECK(rig.registerUIStrings(initNode, "rigStrings") &&
        rig.registerUIStrings(initNode, "more") == VStatus::kFailure);

  // Unloading takes a plug-in's registrations with it and frees their names.
  standin::unloadPlugin(rigObject);
  all = standin::registrations();
  for (const standin::RegistrationInfo &r : all) CHECK(r.plugin == "meshTools");
  CHECK(!VFnPlugin::isNodeRegistered("rigNode") && !standin::createNode("rigNode"));
  CHECK(mesh.registerNode("rigNode", VTypeId(0x100), makeNode, initNode));
  CHECK(rig.registerCommand("again", makeCommand) == VStatus::kFailure);  // not loaded

  // Every announcement counts, and a registration takes the flag back.
  standin::resetAnnouncements();
  VFnPlugin::setRegisteringCallableScript();
  VFnPlugin::setRegisteringCallableScript();
  CHECK(standin::announcements() == 2);
  CHECK(rig.registerCommand("", nullptr) == VStatus::kFailure &&  // refused, flag read all the same
        !VFnPlugin::registeringCallableScript());
  standin::resetAnnouncements();
  CHECK(standin::announcements() == 0);
  standin::unloadAllPlugins();
  CHECK(standin::registrations().empty());
}

// A Python plug-in's side of registration, played without the binding: the
// test adds the reference and makes the announcement that the binding makes,
// and stands in for proxy instances with objects whose "this" converts to the
// address of a C++ node.
const char *kScriptPlugin = R"(
disowned = []
initialized = []

class Proxy:
    def __init__(self, address):
        self.this = address
    def __disown__(self):
        disowned.append(self)
        return self

def creator():
    return Proxy(address)

def initializer():
    initialized.append(True)

def broken():
    raise ValueError('no node today')

def nothing():
    return None
)";

// What the binding does with a callable before passing it: under the lock.
template <typename Function>
Function announced(PyObject *callable) {
  Py_INCREF(callable);
  VFnPlugin::setRegisteringCallableScript();
  return reinterpret_cast<Function>(callable);
}

void testScriptCallables() {
  standin::unloadAllPlugins();
  VObject object = standin::loadPlugin("scripted", "/plug-ins/scripted.py");
  VFnPlugin plugin(object);
  TpythonLock lock;
  PyObject *globals = PyDict_New();
  PyDict_SetItemString(globals, "__builtins__", PyEval_GetBuiltins());
  Py_XDECREF(PyRun_String(kScriptPlugin, Py_file_input, globals, globals));
  CHECK(!PyErr_Occurred());
  auto global = [globals](const char *name) { return PyDict_GetItemString(globals, name); };
  auto handOver = [&](VPxNode *node) {
    PyObject *address = PyLong_FromVoidPtr(node);
    PyDict_SetItemString(globals, "address", address);
    Py_DECREF(address);
  };
  PyObject *creator = global("creator"), *initializer = global("initializer");
  const Py_ssize_t creatorRefs = Py_REFCNT(creator), initializerRefs = Py_REFCNT(initializer);

  standin::resetAnnouncements();
  VCreatorFunction create = announced<VCreatorFunction>(creator);
  VInitializeFunction init = announced<VInitializeFunction>(initializer);
  CHECK(plugin.registerNode("scriptNode", VTypeId(0x500), create, init));
  CHECK(standin::announcements() == 2 && !VFnPlugin::registeringCallableScript());
  // The registry keeps the references it was handed.
  CHECK(Py_REFCNT(creator) == creatorRefs + 1 && Py_REFCNT(initializer) == initializerRefs + 1);
  auto all = standin::registrations();
  CHECK(all.size() == 1 && all[0].scriptCallables() == 2 && all[0].callbacks[0].object == creator &&
        all[0].callbacks[1].role == "initializer" && all[0].callbacks[1].object == initializer);

  // A refused registration lets go of what it was handed.
  CHECK(plugin.registerNode("scriptNode", VTypeId(0x501), announced<VCreatorFunction>(creator),
                            announced<VInitializeFunction>(initializer)) == VStatus::kFailure);
  CHECK(Py_REFCNT(creator) == creatorRefs + 1 && Py_REFCNT(initializer) == initializerRefs + 1);

  standin::resetCounts();
  auto *cxxNode = new CountingNode;
  handOver(cxxNode);
  VPxNode *node = standin::createNode("scriptNode");
  CHECK(node == cxxNode && PyList_Size(global("disowned")) == 1);
  CHECK(node && node->typeName() == "scriptNode" && node->typeId() == VTypeId(0x500));
  CHECK(standin::initializeNode("scriptNode") && PyList_Size(global("initialized")) == 1);

  // A caller's pending error is not the creator's: it survives the call.
  auto *second = new CountingNode;
  handOver(second);
  PyErr_SetString(PyExc_KeyError, "the caller's");
  CHECK(standin::createNode("scriptNode") == second && PyErr_ExceptionMatches(PyExc_KeyError));
  PyErr_Clear();
  standin::deleteNode(second);
  standin::deleteNode(node);
  CHECK(standin::aliveCount("VPxNode") == 0);

  // A failing script is reported to the log and makes nothing.
  CHECK(plugin.registerCommand("brokenCmd", announced<VCreatorFunction>(global("broken"))));
  CHECK(plugin.registerData("nothingData", VTypeId(0x502),
                            announced<VCreatorFunction>(global("nothing"))));
  CHECK(plugin.registerNode("brokenNode", VTypeId(0x503), announced<VCreatorFunction>(creator),
                            announced<VInitializeFunction>(global("broken"))));
  Tlog::clear();
  CHECK(!standin::createCommand("brokenCmd") && !standin::createData(VTypeId(0x502)));
  CHECK(standin::initializeNode("brokenNode") == VStatus::kFailure && !PyErr_Occurred());
  auto log = Tlog::entries();
  CHECK(log.size() == 3 && contains(log[0], "\nValueError: no node today") &&
        contains(log[1],
                 "TypeError: a creator must return an instance of a plug-in class, not "
                 "'NoneType'") &&
        contains(log[2], "in broken\n"));
  CHECK(standin::aliveCount("VPxCommand") == 0 && standin::aliveCount("VPxData") == 0);

  // Deregistering and unloading release the references.
  PyObject *broken = global("broken");
  const Py_ssize_t brokenRefs = Py_REFCNT(broken);
  CHECK(plugin.deregisterNode(VTypeId(0x500)));
  CHECK(Py_REFCNT(creator) == creatorRefs + 1 && Py_REFCNT(initializer) == initializerRefs);
  standin::unloadPlugin(object);
  CHECK(Py_REFCNT(creator) == creatorRefs && Py_REFCNT(broken) == brokenRefs - 2);
  Py_DECREF(globals);
  standin::resetAnnouncements();
}

void testFileTranslators() {
  VPxFileTranslator plain;
  VFileObject file;
  file.setRawFullName("/tmp/a.rig");
  CHECK(plain.filter() == "*.*" && RigTranslator().filter() == "*.rig");
  CHECK(plain.reader(file, "", VPxFileTranslator::kOpenAccessMode) == VStatus::kNotImplemented);
  CHECK(plain.identifyFile(file, "", 0) == VPxFileTranslator::kNotMyFileType);
  standin::setFileAccessMode(VPxFileTranslator::kImportAccessMode);
  CHECK(VPxFileTranslator::fileAccessMode() == VPxFileTranslator::kImportAccessMode);
  standin::setFileAccessMode(VPxFileTranslator::kUnknownAccessMode);

  NotingFilter filter;
  file.setRawFullName("/tmp/shot.va");
  CHECK(filter.haveWriteMethod() && filter.filter() == "*.va");
  CHECK(filter.writer(file, "", VPxFileTranslator::kSaveAccessMode));
  CHECK(filter.seenFile == "shot.va" && !filter.file().isSet());
  CHECK(std::string(standin::lastWrittenScene()) ==
        "//Vorla ASCII 2025 scene\n//Name: shot.va\n// by 2 filters, 0.1\n"
        "requires vorla \"2025\";\n// trailer\n// End of shot.va\n");
  filter.requirements = false;
  filter.failTrailer = true;
  CHECK(filter.writer(file, "", VPxFileTranslator::kSaveAccessMode) == VStatus::kFailure);
  CHECK(contains(standin::lastWrittenScene(), "requires"));  // the failed write left none
  filter.failTrailer = false;
  filter.writer(file, "", VPxFileTranslator::kSaveAccessMode);
  CHECK(!contains(standin::lastWrittenScene(), "requires"));
  CHECK(filter.writer(VFileObject(), "", VPxFileTranslator::kSaveAccessMode) ==
        VStatus::kInvalidParameter);

  VPxVorlaAsciiFilterOutput out;
  out << 1.0 / 3 << " " << -7 << " " << 4000000000u << static_cast<const char *>(nullptr);
  CHECK(std::string(standin::outputText(out)) == "0.3333333333333333 -7 4000000000");
}

// A table that refuses selections wider than one column.
class NarrowTable : public VPxUITableControl {
 public:
  bool allowSelection(int, int left, int, int right) const override { return left == right; }
  using VPxUITableControl::labelString;
};

class ConstraintCommand : public VPxConstraintCommand {
 public:
  const VObject &objectAttribute() const override { return fObject; }
  VObjectArray objectAttributes() {
    VObjectArray array, outputs;
    getObjectAttributesArray(array);
    getOutputAttributes(outputs);
    return outputs.length() == 0 ? array : VObjectArray();
  }
  VObject fObject = standin::makeAttribute("translate");
  using VPxConstraintCommand::constraintOutputAttribute;
  using VPxConstraintCommand::targetType;
};

void testInteraction() {
  VPxContext context;
  VStatus status;
  CHECK(context.setImage("move.png", VPxContext::kImage3) &&
        context.image(VPxContext::kImage3) == "move.png");
  CHECK(context.setImage("x", static_cast<VPxContext::ImageIndex>(3)) ==
            VStatus::kInvalidParameter &&
        context.image(static_cast<VPxContext::ImageIndex>(3), &status) == "" && status.error());
  VIntArray flags;
  flags.append(0);
  flags.append(1);
  CHECK(!context.ignoreEntry(flags, 0) && context.ignoreEntry(flags, 1) &&
        context.ignoreEntry(flags, 2));
  CHECK(context.addManipulator(VObject()) == VStatus::kInvalidParameter &&
        context.addManipulator(standin::makeObject(VFn::kDagNode, "manip")) &&
        context.manipulatorCount() == 1 && context.deleteManipulators() &&
        context.manipulatorCount() == 0);
  CHECK(context.stringClassName() == "" && context.newToolCommand() == nullptr &&
        context.argTypeNumericalInput(0) == VSyntax::kNoArg);

  struct ResultContextCommand : VPxContextCommand {
    using VPxContextCommand::setResult;
  } contextCommand;
  CHECK(contextCommand.makeObj() == nullptr && contextCommand.syntax().canEdit());
  VPxCommand::clearResult();
  CHECK(contextCommand.setResult(7) && VPxCommand::currentIntResult() == 7);
  VPxCommand::clearResult();

  NarrowTable table;
  CHECK(table.setNumberOfRows(4) && table.setNumberOfColumns(3));
  CHECK(table.setSelection(0, 1, 3, 1) && table.selectedCellCount() == 4);
  CHECK(table.setSelection(0, 0, 0, 1) == VStatus::kFailure && table.selectedCellCount() == 4);
  CHECK(table.setSelection(2, 0, 1, 0) == VStatus::kInvalidParameter &&
        table.addToSelection(0, 3) == VStatus::kInvalidParameter);
  CHECK(table.setNumberOfRows(2) && table.selectedCellCount() == 2 && table.isSelected(1, 1));
  CHECK(!table.isSelected(2, 1, &status) && status == VStatus::kInvalidParameter);
  CHECK(table.setNumberOfRows(4) && !table.isSelected(3, 1) && table.removeFromSelection(0, 1) &&
        table.selectedCellCount() == 1);
  CHECK(table.labelString(VPxUITableControl::kColumnLabel, 2) == "3" &&
        table.labelString(VPxUITableControl::kAllLabels, 2) == "");
  CHECK(table.suspendUpdates(true) && table.redrawCells() == VStatus::kFailure &&
        table.suspendUpdates(false) && table.redrawLabels());

  VPx3dModelView view;
  VDagPath camera, other;
  camera.push(standin::makeObject(VFn::kDagNode, "persp"));
  other.push(standin::makeObject(VFn::kDagNode, "top"));
  CHECK(view.getCamera(camera) == VStatus::kNotFound && view.setCamera(VDagPath()).error());
  CHECK(view.setCamera(camera));
  view.removingCamera(other);
  VDagPath read;
  CHECK(view.getCamera(read) && read == camera);
  view.removingCamera(camera);
  CHECK(view.getCamera(read) == VStatus::kNotFound);
  CHECK(view.setFogRange(5, 1) == VStatus::kInvalidParameter && view.fogEnd() == 100.0 &&
        view.setFogDensity(-1) == VStatus::kInvalidParameter);
  CHECK(view.setLightingMode(static_cast<VPx3dModelView::LightingMode>(9)).error() &&
        view.lightingMode() == VPx3dModelView::kLightDefault);

  struct Device : VPxMidiInputDevice {
    using VPxMidiInputDevice::deviceState;
    using VPxMidiInputDevice::openDevice;
  } device;
  CHECK(device.openDevice() == VStatus::kFailure && device.getMessage() == nullptr &&
        device.deviceState() == nullptr && device.doButtonEvents(false));

  ConstraintCommand constraint;
  VObjectArray attributes = constraint.objectAttributes();
  CHECK(attributes.length() == 1 && attributes[0] == constraint.fObject);
  CHECK(constraint.constraintOutputAttribute().isNull() &&
        constraint.targetType() == VPxConstraintCommand::kTransform);
}

}  // namespace

int main() {
  testStatus();
  testStrings();
  testObjectsAndStatics();
  testLifetimes();
  testRotations();
  testTransformationMatrix();
  testCommandResults();
  testArgumentsAndSyntax();
  testPlugins();
  testNodesAndData();
  testMatricesAndPoints();
  testTimesAndEvaluation();
  testNodeOverrides();
  testRegistry();
  testGeometryValues();
  testDeviceValues();
  testTransform();
  testGeometryAndShapes();
  testFileTranslators();
  testInteraction();
  testAttributeSets();
  testGraph();
  testEngines();
  testNodeClasses();
  testInterfaceDefaults();

  Py_InitializeEx(0);
  PyThreadState *mainThread = PyEval_SaveThread();
  testLock();
  testObjectWithLock();
  testExceptionReport();
  testScriptCallables();
  PyEval_RestoreThread(mainThread);
  Py_FinalizeEx();

  if (gFailures)
    std::fprintf(stderr, "host_selftest: %d check(s) failed\n", gFailures);
  else
    std::printf("host_selftest: all checks passed\n");
  return gFailures ? 1 : 0;
}
