// Base class of plug-in implementations of render passes.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VTypes.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxRenderPassImpl {
public:
  enum PassTypeBit {
    kUInt8 = 1,
    kUInt16 = 2,
    kUInt32 = 4,
    kUInt64 = 8,
    kInt8 = 16,
    kInt16 = 32,
    kInt32 = 64,
    kInt64 = 128,
    kFloat16 = 256,
    kFloat32 = 512,
    kFloat64 = 1024,
    kBit = 2048,
    kOther = 4096
  };

  enum PassSemantic {
    kInvalidSemantic,
    kColorSemantic,
    kVectorSemantic,
    kDirectionVectorSemantic,
    kDepthSemantic,
    kLabelSemantic,
    kMaskSemantic,
    kOtherSemantic
  };

  typedef unsigned int PassTypeMask;  // PassTypeBit values or-ed together

  VPxRenderPassImpl();
  virtual ~VPxRenderPassImpl();

  virtual bool isCompatible(const VRenderProfile &profile) const = 0;
  virtual PassTypeMask typesSupported() const = 0;
  virtual PassSemantic frameBufferSemantic() const = 0;
  virtual PassTypeBit getDefaultType() const = 0;
  virtual unsigned int getNumChannels() const = 0;
  virtual bool perLightPassContributionSupported() const = 0;
};

OPENVORLA_NAMESPACE_CLOSE
