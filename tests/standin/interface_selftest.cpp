// Self-test of the host's defaults that keep state or decide something: the
// color value, edit data, resolvers' paths, buffers, transforms and their
// matrices, assemblies, contexts, views and the commands that check what
// they are given. Protected members are reached through subclasses, as a
// derived plug-in class reaches them.
#include <openvorla/MaterialInputData.h>
#include <openvorla/VColor.h>
#include <openvorla/VDGContext.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VEvent.h>
#include <openvorla/VFnPlugin.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VPx3dModelView.h>
#include <openvorla/VPxAnimCurveInterpolator.h>
#include <openvorla/VPxAssembly.h>
#include <openvorla/VPxBakeEngine.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxConstraintCommand.h>
#include <openvorla/VPxEditData.h>
#include <openvorla/VPxFileResolver.h>
#include <openvorla/VPxGlBuffer.h>
#include <openvorla/VPxPolyTweakUVCommand.h>
#include <openvorla/VPxPolyTweakUVInteractiveCommand.h>
#include <openvorla/VPxSelectionContext.h>
#include <openvorla/VPxTexContext.h>
#include <openvorla/VPxTransform.h>
#include <openvorla/VPxTransformationMatrix.h>
#include <openvorla/VPxUIControl.h>

#include <standin/Objects.h>
#include <standin/Plugins.h>

#include <cmath>
#include <fstream>
#include <string>
#include <vector>

#include <unistd.h>

#include "selftest.h"

using namespace OPENVORLA_NAMESPACE;

namespace {

void testColorsAndMaterials() {
  VColor black, c(0.25f, 0.5f, 1.0f);
  CHECK(black == VColor(0, 0, 0, 1) && c.a == 1.0f && c[2] == 1.0f && c != black);
  c[3] = 0.5f;
  CHECK(c.a == 0.5f && c + c == VColor(0.5f, 1, 2, 1) && c * 2.0f == c + c);
  CHECK(c * VColor(2, 2, 2, 2) == c + c);

  MaterialInputData data;
  CHECK(data.diffuse == VColor(0.5f, 0.5f, 0.5f) && data.specular == black &&
        data.shininess == 0.0f && !data.hasTransparency);
}

// Data whose order is its number.
class NumberEdit : public VPxEditData {
 public:
  explicit NumberEdit(int n) : fN(n) {}
  bool performIsEqual(const VPxEditData &o) const override {
    return fN == static_cast<const NumberEdit &>(o).fN;
  }
  bool performIsLessThan(const VPxEditData &o) const override {
    return fN < static_cast<const NumberEdit &>(o).fN;
  }
  int fN;
};

void testEditData() {
  NumberEdit one(1), other(1), two(2);
  CHECK(one == other && one != two && one < two && !(two < one));

  VStatus status;
  CHECK(one.setValue("", "x") == VStatus::kInvalidParameter && one.valueCount() == 0);
  CHECK(one.setValue("color", "red") && one.setValue("size", "3") && one.setValue("color", "blue"));
  CHECK(one.value("color", &status) == "blue" && status && one.valueCount() == 2);
  VStringArray names = one.valueNames();
  CHECK(names.length() == 2 && names[0] == "color" && names[1] == "size");
  CHECK(one.value("shape", &status) == "" && status == VStatus::kNotFound);
  CHECK(one.removeValue("color") && !one.hasValue("color") && one.hasValue("size"));
  CHECK(one.removeValue("color") == VStatus::kNotFound);
}

class PathResolver : public VPxFileResolver {
 public:
  using VPxFileResolver::directory;
  using VPxFileResolver::fileExists;
  using VPxFileResolver::fileName;
  using VPxFileResolver::joinPath;
};

void *makeNothing() { return nullptr; }

void testResolversAndRegisteredKinds() {
  PathResolver r;
  CHECK(r.joinPath("shots/a", "b.va") == "shots/a/b.va" &&
        r.joinPath("shots/", "b.va") == "shots/b.va");
  CHECK(r.joinPath("", "b.va") == "b.va" && r.fileName("/shots/a/b.va") == "b.va");
  CHECK(r.fileName("b.va") == "b.va" && r.directory("/shots/a/b.va") == "/shots/a" &&
        r.directory("b.va") == "");
  std::string path = "/tmp/interface_selftest_" + std::to_string(getpid());
  std::ofstream(path) << "x";
  CHECK(r.fileExists(path.c_str()) && !r.fileExists((path + ".none").c_str()) && !r.fileExists(""));
  std::remove(path.c_str());

  standin::unloadAllPlugins();
  VObject stores = standin::loadPlugin("stores", "/plug-ins/stores");
  VFnPlugin plugin(stores);
  CHECK(plugin.registerURIFileResolver("assetStore", "asset", makeNothing) &&
        plugin.registerURIFileResolver("cloudStore", "cloud", makeNothing));
  VStringArray names = VPxFileResolver::getURIResolversByName();
  VStringArray schemes = VPxFileResolver::getURIResolversBySchemes();
  CHECK(names.length() == 2 && names[0] == "assetStore" && names[1] == "cloudStore");
  CHECK(schemes.length() == 2 && schemes[0] == "asset" && schemes[1] == "cloud");

  int flags = VPxAnimCurveInterpolator::kEvaluateAtKey | VPxAnimCurveInterpolator::kLockType;
  CHECK(plugin.registerAnimCurveInterpolator("stepped", 7, makeNothing, flags));
  CHECK(VPxAnimCurveInterpolator::registeredFlags("stepped") == flags &&
        VPxAnimCurveInterpolator::registeredFlags("linear") == 0);
  standin::unloadAllPlugins();
  CHECK(VPxFileResolver::getURIResolversByName().length() == 0);
}

class OpenBuffer : public VPxGlBuffer {
 public:
  using VPxGlBuffer::bindFbo;
  using VPxGlBuffer::isOpen;
  using VPxGlBuffer::unbindFbo;
};

class Baker : public VPxBakeEngine {
 public:
  VStatus bake(const VObject &, const VString &) override { return VStatus::kSuccess; }
  using VPxBakeEngine::isInterruptRequested;
  using VPxBakeEngine::setProgress;
};

class Control : public VPxUIControl {
 public:
  using VPxUIControl::setWidgetFlag;
};

void testBuffersEnginesAndControls() {
  OpenBuffer buffer;
  CHECK(buffer.bindFbo() == VStatus::kFailure && buffer.closebuffer() == VStatus::kFailure);
  CHECK(buffer.openbuffer(0, 32) == VStatus::kInvalidParameter && !buffer.isOpen());
  CHECK(buffer.openbuffer(64, 32) && buffer.bindFbo() && buffer.unbindFbo());
  CHECK(buffer.unbindFbo() == VStatus::kFailure && buffer.bindFbo() && buffer.closebuffer());
  CHECK(!buffer.isOpen() && buffer.unbindFbo() == VStatus::kFailure);

  Baker baker;
  CHECK(baker.setProgress(0.5) && baker.setProgress(1.5) == VStatus::kInvalidParameter &&
        baker.setProgress(std::nan("")) == VStatus::kInvalidParameter);
  CHECK(!baker.isInterruptRequested());

  Control control;
  CHECK(control.setWidgetFlag("label", VString("Size")) && control.setWidgetFlag("width", 80) &&
        control.setWidgetFlag("", true) == VStatus::kInvalidParameter);
}

class OpenMatrix : public VPxTransformationMatrix {
 public:
  using VPxTransformationMatrix::rotatePivot;
  using VPxTransformationMatrix::rotationOrder;
  using VPxTransformationMatrix::translation;
};

void testMatricesAndTransforms() {
  OpenMatrix m;
  const VVector t(1, -2, 3);
  CHECK(m.translateTo(t) && m.shearTo(VVector(0.5, 0, 0.25)));
  CHECK(m.setScalePivot(VPoint(1, 1, 0), VSpace::kTransform, false));
  CHECK(m.translation() == t && m.asTranslateMatrix().translation() == t &&
        (m.asTranslateMatrix() * m.asTranslateMatrixInverse()).isEquivalent(VMatrix()));
  // With a unit scale the scale matrix is the shear alone.
  CHECK(m.asShearMatrix().isEquivalent(m.asScaleMatrix()));
  CHECK(m.scaleTo(VVector(2, 2, 2)) && !m.asShearMatrix().isEquivalent(m.asScaleMatrix()));
  CHECK(m.setRotationOrder(VTransformationMatrix::kZXY) &&
        m.rotationOrder() == VTransformationMatrix::kZXY && m.rotatePivot() == VPoint());

  VPxTransform original, copy;
  CHECK(!original.hasTransformationMatrix() && original.baseTransformationMatrix == nullptr);
  CHECK(original.translateTo(t) && original.hasTransformationMatrix() &&
        original.baseTransformationMatrix == original.transformationMatrixPtr());
  CHECK(original.setLimit(VFnTransform::kTranslateMaxX, 5) &&
        original.enableLimit(VFnTransform::kTranslateMaxX, true));
  copy.copyInternalData(&original);
  CHECK(copy.getTranslation() == t && copy.isLimited(VFnTransform::kTranslateMaxX) &&
        copy.limitValue(VFnTransform::kTranslateMaxX) == 5);
  VPxNode plain;
  copy.copyInternalData(&plain);  // not a transform: nothing to take
  CHECK(copy.getTranslation() == t);
  CHECK(copy.clearLimits() && !copy.isLimited(VFnTransform::kTranslateMaxX) &&
        copy.limitValue(VFnTransform::kTranslateMaxX) == 5);
  CHECK(copy.resetLimits() && copy.limitValue(VFnTransform::kTranslateMaxX) == 1.0 &&
        copy.limitValue(VFnTransform::kRotateMinY) == -2 * M_PI);
  VObject attr = VPxTransform::translateX;
  CHECK(copy.updateMatrixAttrs(attr, VDGContext()) && copy.updateMatrixAttrs(VDGContext()));
}

// Two representations; records what the host's activation called.
class Rig : public VPxAssembly {
 public:
  VString createRepresentation(const VString &, const VString &, const VString &) override {
    return VString();
  }
  VStringArray getRepresentations() const override {
    VStringArray reps;
    reps.append("box");
    reps.append("full");
    return reps;
  }
  VString getActive() const override { return active; }
  bool activateRep(const VString &rep) override {
    calls.push_back(std::string("activate ") + rep.asUTF8() + (isActivating() ? " inside" : ""));
    if (activates) active = rep;
    return activates;
  }
  VStringArray repTypes() const override { return VStringArray(); }
  VStatus deleteRepresentation(const VString &) override { return VStatus::kSuccess; }
  VStatus deleteAllRepresentations() override { return VStatus::kSuccess; }
  VString getRepType(const VString &) const override { return "proxy"; }
  VString getRepLabel(const VString &) const override { return VString(); }
  VString setRepName(const VString &, const VString &name) override { return name; }
  VStatus setRepLabel(const VString &, const VString &) override { return VStatus::kSuccess; }
  using VPxAssembly::getInitialRep;
  VString getInitialRep() const override { return "box"; }
  bool inactivateRep() override {
    calls.push_back("inactivate");
    return inactivates;
  }
  void preActivateRep(const VString &rep) override {
    calls.push_back(std::string("pre ") + rep.asUTF8());
  }
  void postActivateRep(const VString &rep) override {
    calls.push_back(std::string("post ") + rep.asUTF8());
  }

  VString active;
  bool activates = true;
  bool inactivates = true;
  std::vector<std::string> calls;
};

void testAssemblies() {
  Rig rig;
  rig.postConstructor();  // activates the initial representation
  CHECK(rig.active == "box" && rig.calls.size() == 4 && rig.type() == VPxNode::kAssembly);
  rig.calls.clear();
  CHECK(rig.activate("none") == VStatus::kInvalidParameter && rig.calls.empty());
  CHECK(rig.activate("full") && rig.active == "full" && !rig.isActivating());
  CHECK((rig.calls ==
         std::vector<std::string>{"pre full", "inactivate", "activate full inside", "post full"}));
  rig.calls.clear();
  rig.activates = false;
  CHECK(rig.activate("box") == VStatus::kFailure && rig.calls.back() == "post box");
  rig.calls.clear();
  rig.inactivates = false;
  CHECK(rig.activate("box") == VStatus::kFailure && rig.calls.size() == 2);

  bool hasInitial = false;
  CHECK(rig.getInitialRep(hasInitial) == "box" && hasInitial && rig.repCount() == 2);
  CHECK(rig.addEdit("") == VStatus::kInvalidParameter && !rig.hasEdits());
  CHECK(rig.addEdit("setAttr a") && rig.addEdit("setAttr b") && rig.addEdit("setAttr c"));
  CHECK(rig.removeEdit(1) && rig.removeEdit(2) == VStatus::kInvalidParameter);
  VStringArray edits = rig.edits();
  CHECK(edits.length() == 2 && edits[0] == "setAttr a" && edits[1] == "setAttr c");
  CHECK(rig.clearEdits() && rig.editCount() == 0);
}

class Picker : public VPxSelectionContext {
 public:
  using VPxSelectionContext::isMarquee;
};

void testContexts() {
  Picker picker;
  short x = 0, y = 0;
  CHECK(picker.startPoint(x, y) == VStatus::kFailure && !picker.isSelecting());
  CHECK(picker.allowPreselectHilite() && !picker.allowSoftSelect() && !picker.allowSymmetry() &&
        picker.allowSnapping());
  CHECK(picker.setAllowSymmetry(true) && picker.allowSymmetry());
  VEvent press(10, 20), drag(30, 5), release(40, 6);
  picker.doPress(press);
  CHECK(picker.isSelecting() && !picker.isMarquee() && picker.lastDragPoint(x, y) && x == 10 &&
        y == 20);
  picker.doDrag(drag);
  CHECK(picker.isMarquee() && picker.lastDragPoint(x, y) && x == 30 && y == 5);
  picker.doRelease(release);
  CHECK(!picker.isSelecting() && !picker.isMarquee() && picker.lastDragPoint(x, y) && x == 40);
  CHECK(picker.startPoint(x, y) && x == 10 && y == 20);
  picker.doPress(press);
  picker.abortAction();
  picker.doDrag(drag);  // no selection in progress: nothing moves
  CHECK(!picker.isSelecting() && picker.lastDragPoint(x, y) && x == 10);

  VPxTexContext editor;
  CHECK(editor.setViewRect(1, 0, 0, 1) == VStatus::kInvalidParameter &&
        editor.setPortSize(0, 10) == VStatus::kInvalidParameter);
  editor.viewToPort(0.5, 0.25, x, y);
  double u = 0, v = 0;
  editor.portToView(x, y, u, v);
  CHECK(x == 256 && y == 128 && u == 0.5 && v == 0.25);
  CHECK(editor.setViewRect(-1, 1, -1, 1) && editor.setPortSize(200, 100));
  editor.viewToPort(0, 0, x, y);
  int width = 0, height = 0;
  editor.portSize(width, height);
  CHECK(x == 100 && y == 50 && width == 200 && height == 100);
}

// A view with more user-defined colors than a view may have.
class Viewer : public VPx3dModelView {
 public:
  unsigned int numUserDefinedColors() const override { return 40; }
  using VPx3dModelView::beginGL;
  using VPx3dModelView::drawText;
  using VPx3dModelView::endGL;
};

void testViews() {
  unsigned int before = VPx3dModelView::numberOfViews();
  VPx3dModelView *persp = new VPx3dModelView;
  Viewer side;
  CHECK(VPx3dModelView::numberOfViews() == before + 2 && VPx3dModelView::activeView() == nullptr);
  CHECK(persp->setName("persp") && VPx3dModelView::getModelView("persp") == persp &&
        VPx3dModelView::getModelView("top") == nullptr);
  CHECK(persp->makeActive() && persp->isActive() && !side.isActive());
  delete persp;
  CHECK(VPx3dModelView::activeView() == nullptr && VPx3dModelView::numberOfViews() == before + 1);
  CHECK(VPx3dModelView::refreshAllViews() && side.refreshCount() == 1);

  // 640 by 480 pixels, 100 to a unit, centred: pixel (420, 240) shows x = 1.
  VPoint nearPoint, farPoint;
  VVector direction;
  CHECK(side.viewToWorld(420, 240, nearPoint, farPoint) && nearPoint == VPoint(1, 0, -0.1) &&
        farPoint == VPoint(1, 0, -10000));
  CHECK(side.viewToWorld(420, 240, nearPoint, direction) && direction == VVector(0, 0, -1));
  short x = 0, y = 0;
  double dx = 0, dy = 0;
  CHECK(side.worldToView(VPoint(1, 0, -5), x, y) && x == 420 && y == 240);
  CHECK(!side.worldToView(VPoint(4, 0, 0), dx, dy) && dx == 720);
  VMatrix moved;
  moved.setTranslation(VVector(1, 0, 0));
  CHECK(side.viewToObjectSpace(420, 240, moved.inverse(), nearPoint, farPoint) &&
        nearPoint.isEquivalent(VPoint(0, 0, -0.1)));
  CHECK(side.setCameraClipPlanes(5, 1) == VStatus::kInvalidParameter &&
        side.setCameraClipPlanes(0, 1) == VStatus::kInvalidParameter);

  VStatus status;
  VColor red(1, 0, 0);
  CHECK(side.setActiveColor(3, red) && side.activeColor(3) == red &&
        side.activeColor(2) == VColor(1, 1, 1));
  CHECK(side.setActiveColor(8, red) == VStatus::kInvalidParameter);
  side.activeColor(8, &status);
  CHECK(status == VStatus::kInvalidParameter);
  CHECK(side.setUserDefinedColor(31, red) && side.userDefinedColor(31) == red &&
        side.setUserDefinedColor(32, red) == VStatus::kInvalidParameter);
  VPx3dModelView plain;
  CHECK(plain.setUserDefinedColor(0, red) == VStatus::kInvalidParameter);

  CHECK(side.setObjectDisplay(3, false) && !side.objectDisplay(3) && side.objectDisplay(4));
  CHECK(side.setObjectDisplay(32, true) == VStatus::kInvalidParameter && !side.objectDisplay(32));
  CHECK(side.setPluginObjectDisplay("rig", false) && !side.pluginObjectDisplay("rig"));
  CHECK(side.setObjectDisplayAll(true) && side.objectDisplay(3) && side.pluginObjectDisplay("rig"));
  CHECK(side.setBackgroundColor(red) && side.backgroundColor() == red);
  VColor top, bottom;
  side.getBackgroundGradient(top, bottom);
  CHECK(top == red && bottom == red &&
        plain.backgroundColor() == VPx3dModelView::defaultBackgroundColor());

  CHECK(side.setName("side") && side.setDisplayStyle(1) && side.setDisplayStyle(5).error());
  CHECK(plain.setName("plain") && plain.copySettings(side) && plain.displayStyle() == 1 &&
        plain.name() == "plain" && plain.backgroundColor() == red);

  CHECK(side.endGL() == VStatus::kFailure && side.drawText("x", VPoint()) == VStatus::kFailure);
  CHECK(side.beginGL() && side.drawText("x", VPoint()) && side.endGL());
}

class StrictConstraintCommand : public VPxConstraintCommand {
 public:
  VStatus parseArgs(const VArgList &args) override {
    return args.length() ? VStatus(VStatus::kSuccess) : VStatus(VStatus::kInvalidParameter);
  }
};

class HistoryCommand : public VPxCommand {
 public:
  using VPxCommand::isHistoryOn;
  using VPxCommand::setHistoryOn;
};

void testCommands() {
  StrictConstraintCommand constraint;
  VArgList args;
  CHECK(constraint.doIt(args) == VStatus::kInvalidParameter && constraint.isUndoable());
  args.addArg(VString("pCube1"));
  CHECK(constraint.doIt(args) == VStatus::kNotImplemented);

  HistoryCommand command;
  CHECK(!command.isHistoryOn() && command.setHistoryOn(true) && command.isHistoryOn());

  VPxPolyTweakUVInteractiveCommand tweak;
  CHECK(tweak.cancel() == VStatus::kFailure && tweak.finalize() == VStatus::kFailure &&
        tweak.isUndoable());

  VSyntax syntax = VPxPolyTweakUVCommand::newSyntax();
  CHECK(syntax.hasFlag("-uvs") && syntax.hasFlag("-uvSetName") && syntax.maxObjects() == 1);
}

}  // namespace

void testInterfaceDefaults() {
  testColorsAndMaterials();
  testEditData();
  testResolversAndRegisteredKinds();
  testBuffersEnginesAndControls();
  testMatricesAndTransforms();
  testAssemblies();
  testContexts();
  testViews();
  testCommands();
}
