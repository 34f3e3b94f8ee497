// Base class of the dependency-graph nodes that plug-ins define.
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VObject.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VPxNode {
public:
  enum Type {
    kDependNode,
    kLocatorNode,
    kDeformerNode,
    kManipContainer,
    kSurfaceShape,
    kFieldNode,
    kEmitterNode,
    kSpringNode,
    kIkSolverNode,
    kHardwareShader,
    kHwShaderNode,
    kTransformNode,
    kObjectSet,
    kFluidEmitterNode,
    kImagePlaneNode,
    kParticleAttributeMapperNode,
    kCameraSetNode,
    kConstraintNode,
    kManipulatorNode,
    kMotionPathNode,
    kClientDeviceNode,
    kThreadedDeviceNode,
    kAssembly,
    kSkinCluster,
    kGeometryFilter,
    kBlendShape,
    kLast
  };

  enum PostEvaluationType {
    kEvaluatedIndirectly,
    kEvaluatedDirectly,
    kLeaveDirty,
    kPostEvaluationTypeLast
  };

  enum SchedulingType {
    kParallel = 1,
    kSerial,
    kGloballySerial,
    kUntrusted,
    kSchedulingTypeLast,
    kDefaultScheduling = kSerial,
    kSerialize = kSerial,
    kGloballySerialize = kGloballySerial
  };

  VPxNode();
  virtual ~VPxNode();

  static VObject message;
  static VObject isHistoricallyInteresting;
  static VObject caching;
  static VObject state;
  static VObject frozen;
};

OPENVORLA_NAMESPACE_CLOSE
