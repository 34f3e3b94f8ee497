// Base class of plug-in 3D views.
//
// The host draws the view. A plug-in view may draw the scene several times
// per refresh (one pass per camera, say) and names its kind and its camera's
// heads-up display. The display settings below are the view's own state,
// which the host reads when it draws.
//
// The stand-in draws nothing: its views look down -z through an
// orthographic camera centred on the port, 100 pixels to a world unit, with
// the near and far clip planes at z = -near and z = -far.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VColor.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VMatrix.h>
#include <openvorla/VObject.h>
#include <openvorla/VPoint.h>
#include <openvorla/VSelectionList.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>
#include <openvorla/VVector.h>

#include <memory>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPx3dModelView {
public:
  enum LightingMode {
    kLightAll,
    kLightSelected,
    kLightActive,
    kLightDefault,
    kLightNone,
    kLightQuality
  };

  enum FogSource {
    kFogFragment,
    kFogCoordinate
  };

  enum FogMode {
    kFogLinear,
    kFogExponential,
    kFogExponentialSquared
  };

  VPx3dModelView();
  virtual ~VPx3dModelView();

  // The kind of view, as the host's view commands name it; "" by default.
  virtual VString viewType() const;
  virtual VString getCameraHUDName();  // "" by default: no camera name shown
  virtual bool wantStereoGLBuffer() const;  // false

  // Drawing in several passes (when enabled): the host calls preMultipleDraw,
  // then for each pass preMultipleDrawPass(i), the drawing of every object
  // that okForMultipleDraw accepts, postMultipleDrawPass(i), and last
  // postMultipleDraw. One pass, all objects and nothing more by default.
  virtual unsigned int multipleDrawPassCount();
  virtual void preMultipleDraw();
  virtual void postMultipleDraw();
  virtual void preMultipleDrawPass(unsigned int index);
  virtual void postMultipleDrawPass(unsigned int index);
  virtual bool okForMultipleDraw(const VDagPath &path);
  // The camera is being deleted; the host's default lets go of it if it is
  // the view's camera.
  virtual void removingCamera(VDagPath &cameraPath);

  // The sizes of the view's color tables: the host's 8 active, 8 dormant and
  // no user-defined colors.
  virtual unsigned int numActiveColors() const;
  virtual unsigned int numDormantColors() const;
  virtual unsigned int numUserDefinedColors() const;

  // kInvalidParameter for an invalid path.
  VStatus setCamera(const VDagPath &camera);
  VStatus getCamera(VDagPath &camera) const;  // kNotFound without a camera
  VStatus refresh(bool all = false, bool force = false);
  unsigned int refreshCount() const;

  VStatus setMultipleDrawEnable(bool enable);
  bool multipleDrawEnabled() const;
  VStatus setLightingMode(LightingMode mode);
  LightingMode lightingMode(VStatus *ReturnStatus = NULL) const;
  VStatus setFogEnabled(bool enable);
  bool isFogEnabled(VStatus *ReturnStatus = NULL) const;
  VStatus setFogSource(FogSource source);
  FogSource fogSource(VStatus *ReturnStatus = NULL) const;
  VStatus setFogMode(FogMode mode);
  FogMode fogMode(VStatus *ReturnStatus = NULL) const;
  // Density at least 0; linear fog starts at start and is full at end, with
  // start not beyond end (kInvalidParameter otherwise).
  VStatus setFogDensity(double density);
  double fogDensity(VStatus *ReturnStatus = NULL) const;
  VStatus setFogRange(double start, double end);
  double fogStart(VStatus *ReturnStatus = NULL) const;
  double fogEnd(VStatus *ReturnStatus = NULL) const;
  VStatus setBackfaceCulling(bool cull);
  bool isBackfaceCulling(VStatus *ReturnStatus = NULL) const;
  VStatus setWireframeOnShaded(bool on);
  bool isWireframeOnShaded(VStatus *ReturnStatus = NULL) const;
  VStatus setXrayEnabled(bool on);
  bool isXrayEnabled(VStatus *ReturnStatus = NULL) const;
  VStatus setTwoSidedLighting(bool on);
  bool isTwoSidedLighting(VStatus *ReturnStatus = NULL) const;
  VStatus setDisplayAxis(bool on);
  bool displayAxisOn(VStatus *ReturnStatus = NULL) const;
  VStatus setDisplayHUD(bool on);
  bool displayHUD(VStatus *ReturnStatus = NULL) const;
  // Showing only the objects of the view's selection, named by the prefix.
  VStatus setViewSelected(bool on);
  bool viewSelected(VStatus *ReturnStatus = NULL) const;
  VStatus setViewSelectedPrefix(const VString &prefix);
  VString viewSelectedPrefix(VStatus *ReturnStatus = NULL) const;
  VStatus setDestroyOnPanelDestruction(bool destroy);
  bool destroyOnPanelDestruction(VStatus *ReturnStatus = NULL) const;

  // The name of the view's panel; views are found by it.
  VStatus setName(const VString &name);
  VString name() const;
  VStatus setVisible(bool visible);
  bool isVisible() const;
  // The view the user works in, which makeActive() makes it; null until a
  // view was made active.
  VStatus makeActive();
  bool isActive() const;

  // The size of the port in pixels (640 by 480 until set; kInvalidParameter
  // for an empty port), and where its lower left corner is on the screen.
  VStatus setPortSize(int width, int height);
  int portWidth() const;
  int portHeight() const;
  void portSize(int &width, int &height) const;
  void getScreenPosition(int &x, int &y) const;

  // Between a pixel of the port and the line of world points it shows: from
  // the near point to the far point, or from the near point along the
  // direction. viewToObjectSpace gives the points in the space of an object,
  // given the inverse of its world matrix.
  VStatus viewToWorld(short x, short y, VPoint &nearPoint, VPoint &farPoint) const;
  VStatus viewToWorld(short x, short y, VPoint &worldPoint, VVector &worldDirection) const;
  VStatus viewToObjectSpace(short x, short y, const VMatrix &localMatrixInverse,
                            VPoint &nearPoint, VPoint &farPoint) const;
  // The pixel that shows the point; whether it lies in the port.
  bool worldToView(const VPoint &point, short &x, short &y) const;
  bool worldToView(const VPoint &point, double &x, double &y) const;
  // kInvalidParameter when near is not below far or not positive.
  VStatus setCameraClipPlanes(double nearClip, double farClip);
  void getCameraClipPlanes(double &nearClip, double &farClip) const;
  // A camera the view draws through instead of its own; kNotFound without one.
  VStatus setDrawCameraOverride(const VDagPath &camera);
  VStatus getDrawCameraOverride(VDagPath &camera) const;
  // The camera set node the view draws through, or the null object.
  VStatus setCameraSet(const VObject &cameraSet);
  VObject cameraSet() const;

  // The kinds of objects the view shows, by their index (0 to 31), all at
  // once, and the object types of plug-ins by name; all are shown by default.
  VStatus setObjectDisplay(unsigned int objectType, bool show);
  bool objectDisplay(unsigned int objectType) const;
  VStatus setObjectDisplayAll(bool show);
  VStatus setPluginObjectDisplay(const VString &objectType, bool show);
  bool pluginObjectDisplay(const VString &objectType) const;
  // The objects viewSelected() restricts the view to.
  VStatus setObjectsToView(const VSelectionList &objects);
  VStatus getObjectsToView(VSelectionList &objects) const;
  VStatus setDisplayLayerVisible(const VString &layer, bool visible);
  bool isDisplayLayerVisible(const VString &layer) const;
  VStatus setHUDVisible(const VString &hud, bool visible);
  bool isHUDVisible(const VString &hud) const;
  // Lights the view leaves out in kLightSelected mode; none by default.
  VStatus setLightEnabled(const VDagPath &light, bool enabled);
  bool isLightEnabled(const VDagPath &light) const;

  // Display style: 0 bounding boxes, 1 wireframe, 2 points, 3 flat shaded,
  // 4 smooth shaded (the default); kInvalidParameter for others.
  VStatus setDisplayStyle(int style);
  int displayStyle() const;
  VStatus setTextureDisplayEnabled(bool enable);
  bool isTextureDisplayEnabled() const;
  VStatus setShadowDisplayEnabled(bool enable);
  bool isShadowDisplayEnabled() const;
  VStatus setGridVisible(bool visible);
  bool isGridVisible() const;
  VStatus setUseDefaultMaterial(bool use);
  bool useDefaultMaterial() const;
  // The renderer that draws the view instead of the host's; "" for none.
  VStatus setRendererOverride(const VString &renderer);
  VString rendererOverride() const;
  // The exposure, in stops (0 by default), and gamma (1 by default, positive).
  VStatus setColorManagement(double exposure, double gamma);
  void getColorManagement(double &exposure, double &gamma) const;

  VStatus setFogColor(const VColor &color);
  VColor fogColor() const;  // opaque white by default
  VStatus setBackgroundColor(const VColor &color);
  VColor backgroundColor() const;
  // A gradient from top to bottom replaces the background color; setting
  // the two colors equal gives a plain background.
  VStatus setBackgroundGradient(const VColor &top, const VColor &bottom);
  void getBackgroundGradient(VColor &top, VColor &bottom) const;

  // The colors of the color tables, numActiveColors() active ones (white by
  // default), numDormantColors() dormant ones (grey) and
  // numUserDefinedColors() user-defined ones (black); kInvalidParameter for
  // an index out of range.
  VStatus setActiveColor(unsigned int index, const VColor &color);
  VColor activeColor(unsigned int index, VStatus *ReturnStatus = NULL) const;
  VStatus setDormantColor(unsigned int index, const VColor &color);
  VColor dormantColor(unsigned int index, VStatus *ReturnStatus = NULL) const;
  VStatus setUserDefinedColor(unsigned int index, const VColor &color);
  VColor userDefinedColor(unsigned int index, VStatus *ReturnStatus = NULL) const;

  // Takes the display settings of the other view: not its name, camera,
  // port or color tables.
  VStatus copySettings(const VPx3dModelView &other);

  // The live plug-in views: the active one, how many there are, the first of
  // a name (null when none), and a refresh of them all.
  static VPx3dModelView *activeView();
  static unsigned int numberOfViews();
  static VPx3dModelView *getModelView(const VString &name);
  static VStatus refreshAllViews();
  // The most user-defined colors a view may have, whether the display has
  // stereo buffers, and the background of a new view.
  static unsigned int maxUserDefinedColors();
  static bool isStereoAvailable();
  static VColor defaultBackgroundColor();
  static const char *className();

protected:
  // For drawing of its own in the multiple-draw passes: the bracket around
  // it (kFailure for an unmatched endGL), the color it draws in, and text at
  // a world position.
  VStatus beginGL();
  VStatus endGL();
  VStatus setDrawColor(const VColor &color);
  VStatus drawText(const VString &text, const VPoint &position);

private:
  VDagPath fCamera;
  unsigned int fRefreshes;
  bool fMultipleDraw;
  LightingMode fLighting;
  bool fFog;
  FogSource fFogSource;
  FogMode fFogMode;
  double fFogDensity;
  double fFogStart;
  double fFogEnd;
  bool fBackfaceCulling;
  bool fWireframeOnShaded;
  bool fXray;
  bool fTwoSidedLighting;
  bool fDisplayAxis;
  bool fDisplayHUD;
  bool fViewSelected;
  VString fViewSelectedPrefix;
  bool fDestroyOnPanelDestruction;
  struct Settings;
  std::unique_ptr<Settings> fSettings;
};

OPENVORLA_NAMESPACE_CLOSE
