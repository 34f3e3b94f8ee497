// Set of the kinds of objects and components that a selection may take.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VSelectionMask {
public:
  enum SelectionType {
    kSelectHandles,
    kSelectLocalAxis,
    kSelectLocators,
    kSelectJoints,
    kSelectMeshes,
    kSelectNurbsCurves,
    kSelectNurbsSurfaces,
    kSelectCameras,
    kSelectLights,
    kSelectVertices,
    kSelectEdges,
    kSelectFacets,
    kSelectMeshUVs,
    kSelectCVs,
    kSelectPointsOnCurve,
    kSelectPointsForGravity,
    kSelectPluginShapes,
    kLast
  };

  VSelectionMask();  // selects nothing
  VSelectionMask(SelectionType type);
  VSelectionMask(const VSelectionMask &other);
  ~VSelectionMask();
  VSelectionMask &operator=(const VSelectionMask &other);

  // kInvalidParameter for kLast and values outside the enumeration.
  VStatus setMask(SelectionType type);
  VStatus setMask(const VSelectionMask &mask);
  VStatus addMask(SelectionType type);
  bool intersects(SelectionType type, VStatus *ReturnStatus = NULL) const;
  bool intersects(const VSelectionMask &mask, VStatus *ReturnStatus = NULL) const;
  bool isEmpty() const;

  VSelectionMask operator|(const VSelectionMask &other) const;
  bool operator==(const VSelectionMask &other) const;
  bool operator!=(const VSelectionMask &other) const;

private:
  unsigned int fBits;
};

OPENVORLA_NAMESPACE_CLOSE
