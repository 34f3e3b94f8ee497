// Base class of plug-in data types carried on plugs.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VString.h>
#include <openvorla/VTypeId.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxData {
public:
  enum Type {
    kData,
    kGeometryData,
    kLast
  };

  VPxData();
  virtual ~VPxData();

  virtual void copy(const VPxData &src) = 0;
  virtual VTypeId typeId() const = 0;
  virtual VString name() const = 0;
};

OPENVORLA_NAMESPACE_CLOSE
