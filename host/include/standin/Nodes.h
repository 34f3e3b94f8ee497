// Stand-in only: what the host does around plug-in nodes, for tests and for the
// host's own graph: giving a made node its identity, and the attributes that a
// node type's initializer declares.
#pragma once

#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VTypeId.h>

namespace standin {

// What thisVObject(), name(), typeName() and typeId() report for the node.
OPENVORLA_EXPORT void setNodeIdentity(OPENVORLA_NAMESPACE::VPxNode &node,
                                      const OPENVORLA_NAMESPACE::VObject &object,
                                      const char *typeName,
                                      const OPENVORLA_NAMESPACE::VTypeId &typeId);

// Starts the declarations of a new node type: forgets the attributes and
// dependencies declared so far.
OPENVORLA_EXPORT void beginNodeType();
OPENVORLA_EXPORT unsigned int nodeTypeAttributeCount();
OPENVORLA_EXPORT bool nodeTypeHasAttribute(const OPENVORLA_NAMESPACE::VObject &attribute);
OPENVORLA_EXPORT bool nodeTypeAffects(const OPENVORLA_NAMESPACE::VObject &whenChanges,
                                      const OPENVORLA_NAMESPACE::VObject &isAffected);

}  // namespace standin
