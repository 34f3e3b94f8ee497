// Stand-in only: what the host does around plug-in nodes, for tests and for the
// host's own graph: giving a made node its identity, and the attributes that a
// node type's initializer declares.
#pragma once

#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VTypeId.h>

#include <string>
#include <utility>
#include <vector>

namespace standin {

// What thisVObject(), name(), typeName() and typeId() report for the node.
OPENVORLA_EXPORT void setNodeIdentity(OPENVORLA_NAMESPACE::VPxNode &node,
                                      const OPENVORLA_NAMESPACE::VObject &object,
                                      const char *typeName,
                                      const OPENVORLA_NAMESPACE::VTypeId &typeId);

// Starts the declarations of a new node type: forgets the attributes and
// dependencies declared so far. `given`: the attributes the type has by its
// kind, which attributeAffects may name and addAttribute refuses as added.
// VPxNode::addAttribute and attributeAffects fail outside the declarations of
// a type.
OPENVORLA_EXPORT void beginNodeType(
    const std::vector<OPENVORLA_NAMESPACE::VObject> &given = {});
// Ends them; what was declared stays readable until the next type begins.
OPENVORLA_EXPORT void endNodeType();
OPENVORLA_EXPORT unsigned int nodeTypeAttributeCount();
OPENVORLA_EXPORT bool nodeTypeHasAttribute(const OPENVORLA_NAMESPACE::VObject &attribute);
OPENVORLA_EXPORT bool nodeTypeAffects(const OPENVORLA_NAMESPACE::VObject &whenChanges,
                                      const OPENVORLA_NAMESPACE::VObject &isAffected);

// Everything the last node type declared, in the order it was declared.
struct NodeTypeDeclaration {
  std::vector<OPENVORLA_NAMESPACE::VObject> attributes;
  std::vector<std::pair<OPENVORLA_NAMESPACE::VObject, OPENVORLA_NAMESPACE::VObject>> affects;
  std::string parent;  // the type it inherits its attributes from; "" for none
};
OPENVORLA_EXPORT NodeTypeDeclaration nodeTypeDeclaration();

}  // namespace standin
