// Base class of plug-in data types that hold geometry.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VPxData.h>
#include <openvorla/VString.h>
#include <openvorla/VTypeId.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxGeometryData : public VPxData {
public:
  VPxGeometryData();
  ~VPxGeometryData() override;

  void copy(const VPxData &src) override = 0;
  VTypeId typeId() const override = 0;
  VString name() const override = 0;
};

OPENVORLA_NAMESPACE_CLOSE
