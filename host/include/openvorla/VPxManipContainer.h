// Base class of plug-in containers of manipulators.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxManipContainer : public VPxNode {
public:
  enum ManipType {
    kFreePointTriadManip,
    kDirectionManip,
    kDistanceManip,
    kPointOnCurveManip,
    kPointOnSurfaceManip,
    kDiscManip,
    kCircleSweepManip,
    kToggleManip,
    kStateManip,
    kCurveSegmentManip,
    kCustomManip
  };

  VPxManipContainer();
  ~VPxManipContainer() override;
};

OPENVORLA_NAMESPACE_CLOSE
