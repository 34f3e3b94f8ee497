// VPx3dModelView: the host's default view behaviour, the view's display
// settings and the list of live views.
#include <openvorla/VPx3dModelView.h>

#include <standin/Lifetime.h>

#include <algorithm>
#include <cmath>
#include <map>
#include <mutex>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

// The settings added to the view's own fields, kept out of the header.
struct VPx3dModelView::Settings {
  VString name;
  bool visible = true;
  int width = 640;
  int height = 480;
  double nearClip = 0.1;
  double farClip = 10000.0;
  VDagPath drawCamera;
  VObject cameraSet;
  unsigned int hiddenObjectTypes = 0;  // bit n: kind n is hidden
  std::vector<VString> hiddenPluginObjects;
  VSelectionList objectsToView;
  std::vector<VString> hiddenLayers;
  std::vector<VString> hiddenHUDs;
  std::vector<VDagPath> disabledLights;
  int displayStyle = 4;
  bool textures = false;
  bool shadows = false;
  bool grid = true;
  bool defaultMaterial = false;
  VString renderer;
  double exposure = 0.0;
  double gamma = 1.0;
  VColor fogColor{1.0f, 1.0f, 1.0f};
  VColor gradientTop = defaultBackgroundColor();
  VColor gradientBottom = defaultBackgroundColor();
  std::map<unsigned int, VColor> activeColors;
  std::map<unsigned int, VColor> dormantColors;
  std::map<unsigned int, VColor> userColors;
  int glDepth = 0;
  VColor drawColor;
};

namespace {

constexpr double kPixelsPerUnit = 100.0;

struct Views {
  std::mutex mutex;
  std::vector<VPx3dModelView *> live;
  VPx3dModelView *active = nullptr;
};

Views &views() {
  static Views v;
  return v;
}

template <typename T>
bool contains(const std::vector<T> &list, const T &item) {
  return std::find(list.begin(), list.end(), item) != list.end();
}

// Adds the item to the list, or takes it out, once.
template <typename T>
VStatus include(std::vector<T> &list, const T &item, bool in) {
  auto it = std::find(list.begin(), list.end(), item);
  if (in && it == list.end()) list.push_back(item);
  if (!in && it != list.end()) list.erase(it);
  return VStatus::kSuccess;
}

VStatus badIndex() { return VStatus(VStatus::kInvalidParameter, "No color of that index"); }

VStatus setColor(std::map<unsigned int, VColor> &table, unsigned int size, unsigned int index,
                 const VColor &color) {
  if (index >= size) return badIndex();
  table[index] = color;
  return VStatus::kSuccess;
}

VColor getColor(const std::map<unsigned int, VColor> &table, unsigned int size, unsigned int index,
                const VColor &fallback, VStatus *ReturnStatus) {
  if (ReturnStatus) *ReturnStatus = index < size ? VStatus(VStatus::kSuccess) : badIndex();
  auto it = table.find(index);
  return it == table.end() || index >= size ? fallback : it->second;
}

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
      fDestroyOnPanelDestruction(true),
      fSettings(new Settings) {
  Views &v = views();
  std::lock_guard<std::mutex> guard(v.mutex);
  v.live.push_back(this);
  standin::noteConstructed("VPx3dModelView");
}

VPx3dModelView::~VPx3dModelView() {
  {
    Views &v = views();
    std::lock_guard<std::mutex> guard(v.mutex);
    v.live.erase(std::find(v.live.begin(), v.live.end(), this));
    if (v.active == this) v.active = nullptr;
  }
  standin::noteDestroyed("VPx3dModelView");
}

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

VStatus VPx3dModelView::setName(const VString &name) { return store(fSettings->name, name); }
VString VPx3dModelView::name() const { return fSettings->name; }
VStatus VPx3dModelView::setVisible(bool visible) { return store(fSettings->visible, visible); }
bool VPx3dModelView::isVisible() const { return fSettings->visible; }

VStatus VPx3dModelView::makeActive() {
  Views &v = views();
  std::lock_guard<std::mutex> guard(v.mutex);
  v.active = this;
  return VStatus::kSuccess;
}

bool VPx3dModelView::isActive() const { return activeView() == this; }

VStatus VPx3dModelView::setPortSize(int width, int height) {
  if (width <= 0 || height <= 0) return VStatus(VStatus::kInvalidParameter, "Empty port");
  fSettings->width = width;
  fSettings->height = height;
  return VStatus::kSuccess;
}

int VPx3dModelView::portWidth() const { return fSettings->width; }
int VPx3dModelView::portHeight() const { return fSettings->height; }

void VPx3dModelView::portSize(int &width, int &height) const {
  width = fSettings->width;
  height = fSettings->height;
}

void VPx3dModelView::getScreenPosition(int &x, int &y) const { x = y = 0; }

VStatus VPx3dModelView::viewToWorld(short x, short y, VPoint &nearPoint, VPoint &farPoint) const {
  double wx = (x - fSettings->width / 2.0) / kPixelsPerUnit;
  double wy = (y - fSettings->height / 2.0) / kPixelsPerUnit;
  nearPoint = VPoint(wx, wy, -fSettings->nearClip);
  farPoint = VPoint(wx, wy, -fSettings->farClip);
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::viewToWorld(short x, short y, VPoint &worldPoint,
                                    VVector &worldDirection) const {
  VPoint farPoint;
  viewToWorld(x, y, worldPoint, farPoint);
  worldDirection = VVector(0.0, 0.0, -1.0);
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::viewToObjectSpace(short x, short y, const VMatrix &localMatrixInverse,
                                          VPoint &nearPoint, VPoint &farPoint) const {
  viewToWorld(x, y, nearPoint, farPoint);
  nearPoint = nearPoint * localMatrixInverse;
  farPoint = farPoint * localMatrixInverse;
  return VStatus::kSuccess;
}

bool VPx3dModelView::worldToView(const VPoint &point, double &x, double &y) const {
  VPoint p = point;
  if (!p.cartesianize()) return false;
  x = p.x * kPixelsPerUnit + fSettings->width / 2.0;
  y = p.y * kPixelsPerUnit + fSettings->height / 2.0;
  return x >= 0 && x < fSettings->width && y >= 0 && y < fSettings->height;
}

bool VPx3dModelView::worldToView(const VPoint &point, short &x, short &y) const {
  double px = 0.0, py = 0.0;
  bool inside = worldToView(point, px, py);
  x = static_cast<short>(std::lround(std::clamp(px, -32768.0, 32767.0)));
  y = static_cast<short>(std::lround(std::clamp(py, -32768.0, 32767.0)));
  return inside;
}

VStatus VPx3dModelView::setCameraClipPlanes(double nearClip, double farClip) {
  if (!(nearClip > 0.0 && nearClip < farClip))
    return VStatus(VStatus::kInvalidParameter, "The clip planes are out of order");
  fSettings->nearClip = nearClip;
  fSettings->farClip = farClip;
  return VStatus::kSuccess;
}

void VPx3dModelView::getCameraClipPlanes(double &nearClip, double &farClip) const {
  nearClip = fSettings->nearClip;
  farClip = fSettings->farClip;
}

VStatus VPx3dModelView::setDrawCameraOverride(const VDagPath &camera) {
  return store(fSettings->drawCamera, camera);
}

VStatus VPx3dModelView::getDrawCameraOverride(VDagPath &camera) const {
  if (!fSettings->drawCamera.isValid())
    return VStatus(VStatus::kNotFound, "The view draws through its own camera");
  camera = fSettings->drawCamera;
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::setCameraSet(const VObject &cameraSet) {
  return store(fSettings->cameraSet, cameraSet);
}

VObject VPx3dModelView::cameraSet() const { return fSettings->cameraSet; }

VStatus VPx3dModelView::setObjectDisplay(unsigned int objectType, bool show) {
  if (objectType > 31) return VStatus(VStatus::kInvalidParameter, "No such kind of object");
  unsigned int bit = 1u << objectType;
  fSettings->hiddenObjectTypes =
      show ? fSettings->hiddenObjectTypes & ~bit : fSettings->hiddenObjectTypes | bit;
  return VStatus::kSuccess;
}

bool VPx3dModelView::objectDisplay(unsigned int objectType) const {
  return objectType <= 31 && !(fSettings->hiddenObjectTypes & (1u << objectType));
}

VStatus VPx3dModelView::setObjectDisplayAll(bool show) {
  fSettings->hiddenObjectTypes = show ? 0u : ~0u;
  fSettings->hiddenPluginObjects.clear();
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::setPluginObjectDisplay(const VString &objectType, bool show) {
  return include(fSettings->hiddenPluginObjects, objectType, !show);
}

bool VPx3dModelView::pluginObjectDisplay(const VString &objectType) const {
  return !contains(fSettings->hiddenPluginObjects, objectType);
}

VStatus VPx3dModelView::setObjectsToView(const VSelectionList &objects) {
  return store(fSettings->objectsToView, objects);
}

VStatus VPx3dModelView::getObjectsToView(VSelectionList &objects) const {
  objects = fSettings->objectsToView;
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::setDisplayLayerVisible(const VString &layer, bool visible) {
  return include(fSettings->hiddenLayers, layer, !visible);
}

bool VPx3dModelView::isDisplayLayerVisible(const VString &layer) const {
  return !contains(fSettings->hiddenLayers, layer);
}

VStatus VPx3dModelView::setHUDVisible(const VString &hud, bool visible) {
  return include(fSettings->hiddenHUDs, hud, !visible);
}

bool VPx3dModelView::isHUDVisible(const VString &hud) const {
  return !contains(fSettings->hiddenHUDs, hud);
}

VStatus VPx3dModelView::setLightEnabled(const VDagPath &light, bool enabled) {
  if (!light.isValid()) return VStatus(VStatus::kInvalidParameter, "Not a light path");
  return include(fSettings->disabledLights, light, !enabled);
}

bool VPx3dModelView::isLightEnabled(const VDagPath &light) const {
  return !contains(fSettings->disabledLights, light);
}

VStatus VPx3dModelView::setDisplayStyle(int style) {
  if (style < 0 || style > 4) return VStatus(VStatus::kInvalidParameter, "Not a display style");
  return store(fSettings->displayStyle, style);
}

int VPx3dModelView::displayStyle() const { return fSettings->displayStyle; }

VStatus VPx3dModelView::setTextureDisplayEnabled(bool enable) {
  return store(fSettings->textures, enable);
}

bool VPx3dModelView::isTextureDisplayEnabled() const { return fSettings->textures; }

VStatus VPx3dModelView::setShadowDisplayEnabled(bool enable) {
  return store(fSettings->shadows, enable);
}

bool VPx3dModelView::isShadowDisplayEnabled() const { return fSettings->shadows; }
VStatus VPx3dModelView::setGridVisible(bool visible) { return store(fSettings->grid, visible); }
bool VPx3dModelView::isGridVisible() const { return fSettings->grid; }

VStatus VPx3dModelView::setUseDefaultMaterial(bool use) {
  return store(fSettings->defaultMaterial, use);
}

bool VPx3dModelView::useDefaultMaterial() const { return fSettings->defaultMaterial; }

VStatus VPx3dModelView::setRendererOverride(const VString &renderer) {
  return store(fSettings->renderer, renderer);
}

VString VPx3dModelView::rendererOverride() const { return fSettings->renderer; }

VStatus VPx3dModelView::setColorManagement(double exposure, double gamma) {
  if (!(gamma > 0.0)) return VStatus(VStatus::kInvalidParameter, "Gamma must be positive");
  fSettings->exposure = exposure;
  fSettings->gamma = gamma;
  return VStatus::kSuccess;
}

void VPx3dModelView::getColorManagement(double &exposure, double &gamma) const {
  exposure = fSettings->exposure;
  gamma = fSettings->gamma;
}

VStatus VPx3dModelView::setFogColor(const VColor &color) {
  return store(fSettings->fogColor, color);
}
VColor VPx3dModelView::fogColor() const { return fSettings->fogColor; }
VStatus VPx3dModelView::setBackgroundColor(const VColor &color) {
  return setBackgroundGradient(color, color);
}

VColor VPx3dModelView::backgroundColor() const { return fSettings->gradientTop; }

VStatus VPx3dModelView::setBackgroundGradient(const VColor &top, const VColor &bottom) {
  fSettings->gradientTop = top;
  fSettings->gradientBottom = bottom;
  return VStatus::kSuccess;
}

void VPx3dModelView::getBackgroundGradient(VColor &top, VColor &bottom) const {
  top = fSettings->gradientTop;
  bottom = fSettings->gradientBottom;
}

VStatus VPx3dModelView::setActiveColor(unsigned int index, const VColor &color) {
  return setColor(fSettings->activeColors, numActiveColors(), index, color);
}

VColor VPx3dModelView::activeColor(unsigned int index, VStatus *ReturnStatus) const {
  return getColor(fSettings->activeColors, numActiveColors(), index, VColor(1.0f, 1.0f, 1.0f),
                  ReturnStatus);
}

VStatus VPx3dModelView::setDormantColor(unsigned int index, const VColor &color) {
  return setColor(fSettings->dormantColors, numDormantColors(), index, color);
}

VColor VPx3dModelView::dormantColor(unsigned int index, VStatus *ReturnStatus) const {
  return getColor(fSettings->dormantColors, numDormantColors(), index, VColor(0.5f, 0.5f, 0.5f),
                  ReturnStatus);
}

VStatus VPx3dModelView::setUserDefinedColor(unsigned int index, const VColor &color) {
  unsigned int size = std::min(numUserDefinedColors(), maxUserDefinedColors());
  return setColor(fSettings->userColors, size, index, color);
}

VColor VPx3dModelView::userDefinedColor(unsigned int index, VStatus *ReturnStatus) const {
  unsigned int size = std::min(numUserDefinedColors(), maxUserDefinedColors());
  return getColor(fSettings->userColors, size, index, VColor(), ReturnStatus);
}

VStatus VPx3dModelView::copySettings(const VPx3dModelView &other) {
  if (&other == this) return VStatus::kSuccess;
  Settings kept = *fSettings;
  *fSettings = *other.fSettings;
  fSettings->name = kept.name;
  fSettings->visible = kept.visible;
  fSettings->width = kept.width;
  fSettings->height = kept.height;
  fSettings->activeColors = kept.activeColors;
  fSettings->dormantColors = kept.dormantColors;
  fSettings->userColors = kept.userColors;
  fSettings->glDepth = kept.glDepth;
  fSettings->drawColor = kept.drawColor;
  fMultipleDraw = other.fMultipleDraw;
  fLighting = other.fLighting;
  fFog = other.fFog;
  fFogSource = other.fFogSource;
  fFogMode = other.fFogMode;
  fFogDensity = other.fFogDensity;
  fFogStart = other.fFogStart;
  fFogEnd = other.fFogEnd;
  fBackfaceCulling = other.fBackfaceCulling;
  fWireframeOnShaded = other.fWireframeOnShaded;
  fXray = other.fXray;
  fTwoSidedLighting = other.fTwoSidedLighting;
  fDisplayAxis = other.fDisplayAxis;
  fDisplayHUD = other.fDisplayHUD;
  fViewSelected = other.fViewSelected;
  fViewSelectedPrefix = other.fViewSelectedPrefix;
  return VStatus::kSuccess;
}

VPx3dModelView *VPx3dModelView::activeView() {
  Views &v = views();
  std::lock_guard<std::mutex> guard(v.mutex);
  return v.active;
}

unsigned int VPx3dModelView::numberOfViews() {
  Views &v = views();
  std::lock_guard<std::mutex> guard(v.mutex);
  return static_cast<unsigned int>(v.live.size());
}

VPx3dModelView *VPx3dModelView::getModelView(const VString &name) {
  Views &v = views();
  std::lock_guard<std::mutex> guard(v.mutex);
  for (VPx3dModelView *view : v.live)
    if (view->fSettings->name == name) return view;
  return nullptr;
}

VStatus VPx3dModelView::refreshAllViews() {
  std::vector<VPx3dModelView *> live;
  {
    Views &v = views();
    std::lock_guard<std::mutex> guard(v.mutex);
    live = v.live;
  }
  for (VPx3dModelView *view : live) view->refresh(true, false);
  return VStatus::kSuccess;
}

unsigned int VPx3dModelView::maxUserDefinedColors() { return 32; }
bool VPx3dModelView::isStereoAvailable() { return false; }
VColor VPx3dModelView::defaultBackgroundColor() { return VColor(0.36f, 0.36f, 0.36f); }
const char *VPx3dModelView::className() { return "VPx3dModelView"; }

VStatus VPx3dModelView::beginGL() {
  ++fSettings->glDepth;
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::endGL() {
  if (fSettings->glDepth == 0) return VStatus(VStatus::kFailure, "endGL without beginGL");
  --fSettings->glDepth;
  return VStatus::kSuccess;
}

VStatus VPx3dModelView::setDrawColor(const VColor &color) {
  return store(fSettings->drawColor, color);
}

// The stand-in has no drawing context: text is drawn nowhere.
VStatus VPx3dModelView::drawText(const VString &, const VPoint &) {
  if (fSettings->glDepth == 0) return VStatus(VStatus::kFailure, "Drawing outside beginGL");
  return VStatus::kSuccess;
}

OPENVORLA_NAMESPACE_CLOSE
