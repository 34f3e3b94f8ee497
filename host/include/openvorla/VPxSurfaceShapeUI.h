// Base class of the drawing and selection side of plug-in surface shapes.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

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
};

OPENVORLA_NAMESPACE_CLOSE
