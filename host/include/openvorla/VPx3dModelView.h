// Base class of plug-in 3D views.
//
// The host draws the view. A plug-in view may draw the scene several times
// per refresh (one pass per camera, say) and names its kind and its camera's
// heads-up display. The display settings below are the view's own state,
// which the host reads when it draws.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

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
  static const char *className();

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
};

OPENVORLA_NAMESPACE_CLOSE
