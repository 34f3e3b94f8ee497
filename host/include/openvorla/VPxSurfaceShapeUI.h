// Base class of the drawing and selection side of plug-in surface shapes.
//
// The host makes one UI object per shape through the creator registered with
// the shape. When it draws, it asks the object for draw requests and calls
// draw() for each; when the user clicks or drags a marquee it calls select()
// (snap() while snapping). The host's defaults draw and select nothing.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VDagPath.h>
#include <openvorla/VSelectionList.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class V3dView;
class VDrawData;
class VDrawInfo;
class VDrawRequest;
class VDrawRequestQueue;
class VMaterialArray;
class VPointArray;
class VPxSurfaceShape;
class VSelectInfo;
class VTextureEditorDrawInfo;

class OPENVORLA_EXPORT VPxSurfaceShapeUI {
public:
  enum SelectionType {
    kSelectMeshUVs,
    kSelectMeshVerts,
    kSelectMeshFaces,
    kSelectMeshEdges
  };

  VPxSurfaceShapeUI();
  virtual ~VPxSurfaceShapeUI();

  // Adds a request to the queue for each thing to draw; objectAndActiveOnly
  // asks only for the object and its active components.
  virtual void getDrawRequests(const VDrawInfo &info, bool objectAndActiveOnly,
                               VDrawRequestQueue &requests);
  virtual void draw(const VDrawRequest &request, V3dView &view) const;
  // Adds what was hit to selectionList and the points hit, in world space, to
  // worldSpaceSelectPts; whether anything was hit.
  virtual bool select(VSelectInfo &selectInfo, VSelectionList &selectionList,
                      VPointArray &worldSpaceSelectPts) const;
  // Sets the snap point in snapInfo; whether there is one.
  virtual bool snap(VSelectInfo &snapInfo) const;

  // The texture editor: whether the shape draws its UVs there, the drawing,
  // and the selection of UV components in a rectangle of the view.
  virtual bool canDrawUV() const;
  virtual void drawUV(V3dView &view, const VTextureEditorDrawInfo &info) const;
  virtual bool selectUV(V3dView &view, SelectionType selectionType, int xmin, int ymin, int xmax,
                        int ymax, bool singleSelection, VSelectionList &selectionList) const;

  // The shape the host made the object for; null until it is attached to one.
  VPxSurfaceShape *surfaceShape() const;
  // The UI object of the shape at the end of path; null for other nodes.
  static VPxSurfaceShapeUI *surfaceShapeUI(const VDagPath &path);

protected:
  // Attaches the geometry to the draw data that a request carries to draw().
  void getDrawData(const void *geometry, VDrawData &data) const;
  // The materials of the shape's instance; kNotFound while unattached.
  VStatus getMaterials(VMaterialArray &materials) const;
  bool isTemplated() const;
  bool isSelected() const;

private:
  VPxSurfaceShape *fShape;
};

OPENVORLA_NAMESPACE_CLOSE
