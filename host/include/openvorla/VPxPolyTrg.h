// Base class of plug-in polygon triangulators.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxNode.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxPolyTrg : public VPxNode {
public:
  VPxPolyTrg();
  ~VPxPolyTrg() override;
};

OPENVORLA_NAMESPACE_CLOSE
