// VPx3dModelView: the host's default view behaviour and the view's display
// settings.
#include <openvorla/VPx3dModelView.h>

#include <standin/Lifetime.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

template <typename T>
T read(VStatus *ReturnStatus, T value) {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return value;
}

template <typename T>
VStatus store(T &slot, T value) {
  slot = value;
  return VStatus::kSuccess;
}

}  // namespace

VPx3dModelView::VPx3dModelView()
    : fRefreshes(0),
      fMultipleDraw(false),
      fLighting(kLightDefault),
      fFog(false),
      fFogSource(kFogFragment),
      fFogMode(kFogLinear),
      fFogDensity(0.1),
      fFogStart(0.0),
      fFogEnd(100.0),
      fBackfaceCulling(false),
      fWireframeOnShaded(false),
      fXray(false),
      fTwoSidedLighting(true),
      fDisplayAxis(true),
      fDisplayHUD(true),
      fViewSelected(false),
      fDestroyOnPanelDestruction(true) {
  standin::noteConstructed("VPx3dModelView");
}

VPx3dModelView::~VPx3dModelView() { standin::noteDestroyed("VPx3dModelView"); }

VString VPx3dModelView::viewType() const { return VString(); }
VString VPx3dModelView::getCameraHUDName() { return VString(); }
bool VPx3dModelView::wantStereoGLBuffer() const { return false; }
unsigned int VPx3dModelView::multipleDrawPassCount() { return 1; }
void VPx3dModelView::preMultipleDraw() {}
void VPx3dModelView::postMultipleDraw() {}
void VPx3dModelView::preMultipleDrawPass(unsigned int) {}
void VPx3dModelView::postMultipleDrawPass(unsigned int) {}
bool VPx3dModelView::okForMultipleDraw(const VDagPath &) { return true; }

void VPx3dModelView::removingCamera(VDagPath &cameraPath) {
  if (fCamera.isValid() && fCamera == cameraPath) fCamera = VDagPath();
}

unsigned int VPx3dModelView::numActiveColors() const { return 8; }
unsigned int VPx3dModelView::numDormantColors() const { return 8; }
unsigned int VPx3dModelView::numUserDefinedColors() const { return 0; }

VStatus VPx3dModelView::setCamera(const VDagPath &camera) {
  if (!camera.isValid()) return VStatus(VStatus::kInvalidParameter, "Not a camera path");
  fCamera = camera;
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::getCamera(VDagPath &camera) const {
  if (!fCamera.isValid()) return VStatus(VStatus::kNotFound, "The view has no camera");
  camera = fCamera;
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::refresh(bool, bool) {
  ++fRefreshes;
  return VStatus::kSuccess;
}

unsigned int VPx3dModelView::refreshCount() const { return fRefreshes; }

VStatus VPx3dModelView::setMultipleDrawEnable(bool enable) { return store(fMultipleDraw, enable); }
bool VPx3dModelView::multipleDrawEnabled() const { return fMultipleDraw; }

VStatus VPx3dModelView::setLightingMode(LightingMode mode) {
  if (mode < kLightAll || mode > kLightQuality)
    return VStatus(VStatus::kInvalidParameter, "Not a lighting mode");
  return store(fLighting, mode);
}

VPx3dModelView::LightingMode VPx3dModelView::lightingMode(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fLighting);
}

VStatus VPx3dModelView::setFogEnabled(bool enable) { return store(fFog, enable); }
bool VPx3dModelView::isFogEnabled(VStatus *ReturnStatus) const { return read(ReturnStatus, fFog); }

VStatus VPx3dModelView::setFogSource(FogSource source) {
  if (source != kFogFragment && source != kFogCoordinate)
    return VStatus(VStatus::kInvalidParameter, "Not a fog source");
  return store(fFogSource, source);
}

VPx3dModelView::FogSource VPx3dModelView::fogSource(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fFogSource);
}

VStatus VPx3dModelView::setFogMode(FogMode mode) {
  if (mode < kFogLinear || mode > kFogExponentialSquared)
    return VStatus(VStatus::kInvalidParameter, "Not a fog mode");
  return store(fFogMode, mode);
}

VPx3dModelView::FogMode VPx3dModelView::fogMode(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fFogMode);
}

VStatus VPx3dModelView::setFogDensity(double density) {
  if (!(density >= 0.0)) return VStatus(VStatus::kInvalidParameter, "Negative fog density");
  return store(fFogDensity, density);
}

double VPx3dModelView::fogDensity(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fFogDensity);
}

VStatus VPx3dModelView::setFogRange(double start, double end) {
  if (!(start <= end)) return VStatus(VStatus::kInvalidParameter, "Fog starts beyond its end");
  fFogStart = start;
  fFogEnd = end;
  return VStatus::kSuccess;
}

double VPx3dModelView::fogStart(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fFogStart);
}

double VPx3dModelView::fogEnd(VStatus *ReturnStatus) const { return read(ReturnStatus, fFogEnd); }

VStatus VPx3dModelView::setBackfaceCulling(bool cull) { return store(fBackfaceCulling, cull); }

bool VPx3dModelView::isBackfaceCulling(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fBackfaceCulling);
}

VStatus VPx3dModelView::setWireframeOnShaded(bool on) { return store(fWireframeOnShaded, on); }

bool VPx3dModelView::isWireframeOnShaded(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fWireframeOnShaded);
}

VStatus VPx3dModelView::setXrayEnabled(bool on) { return store(fXray, on); }
bool VPx3dModelView::isXrayEnabled(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fXray);
}

VStatus VPx3dModelView::setTwoSidedLighting(bool on) { return store(fTwoSidedLighting, on); }

bool VPx3dModelView::isTwoSidedLighting(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fTwoSidedLighting);
}

VStatus VPx3dModelView::setDisplayAxis(bool on) { return store(fDisplayAxis, on); }

bool VPx3dModelView::displayAxisOn(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fDisplayAxis);
}

VStatus VPx3dModelView::setDisplayHUD(bool on) { return store(fDisplayHUD, on); }
bool VPx3dModelView::displayHUD(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fDisplayHUD);
}

VStatus VPx3dModelView::setViewSelected(bool on) { return store(fViewSelected, on); }

bool VPx3dModelView::viewSelected(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fViewSelected);
}

VStatus VPx3dModelView::setViewSelectedPrefix(const VString &prefix) {
  fViewSelectedPrefix = prefix;
  return VStatus::kSuccess;
}

VString VPx3dModelView::viewSelectedPrefix(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fViewSelectedPrefix);
}

VStatus VPx3dModelView::setDestroyOnPanelDestruction(bool destroy) {
  return store(fDestroyOnPanelDestruction, destroy);
}

bool VPx3dModelView::destroyOnPanelDestruction(VStatus *ReturnStatus) const {
  return read(ReturnStatus, fDestroyOnPanelDestruction);
}

const char *VPx3dModelView::className() { return "VPx3dModelView"; }

OPENVORLA_NAMESPACE_CLOSE
