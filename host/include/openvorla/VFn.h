// Kinds of host objects, as VObject::apiType() reports them.
#pragma once

#include <openvorla/VApiVersion.h>

OPENVORLA_NAMESPACE_OPEN

class OPENVORLA_EXPORT VFn {
public:
  enum Type {
    kInvalid,
    kBase,
    kNamedObject,
    kDependencyNode,
    kDagNode,
    kTransform,
    kAttribute,
    kData,
    kPluginData,
    kPlugin,
    kLast
  };
};

OPENVORLA_NAMESPACE_CLOSE
