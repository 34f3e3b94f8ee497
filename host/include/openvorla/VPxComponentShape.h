// Base class of plug-in surface shapes whose components are control points.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxSurfaceShape.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxComponentShape : public VPxSurfaceShape {
public:
  VPxComponentShape();
  ~VPxComponentShape() override;

  // The component shape's control points are its components: these select,
  // name and move them through the control point attributes.
  void componentToPlugs(VObject &component, VSelectionList &selectionList) const override;
  MatchResult matchComponent(const VSelectionList &item, const VAttributeSpecArray &spec,
                             VSelectionList &list) override;
  bool match(const VSelectionMask &mask, const VObjectArray &componentList) const override;
  VObject createFullVertexGroup() const override;
  VObject localShapeInAttr() const override;
  void transformUsing(const VMatrix &mat, const VObjectArray &componentList,
                      PointCachingMode cachingMode = kNoPointCaching,
                      VPointArray *pointCache = NULL) override;

  static const char *className();
};

OPENVORLA_NAMESPACE_CLOSE
