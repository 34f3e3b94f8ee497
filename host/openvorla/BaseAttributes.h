// The attributes a proxy class gives every node of its kind (a deformer's
// geometry and envelope, a transform's components and matrix, a locator's
// position and scale), which of them affects which, and the values the host
// computes for them when the node's own compute leaves them to it.
#pragma once

#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>

#include <utility>
#include <vector>

namespace standin {
namespace graph {
class Node;
}

namespace bases {

namespace ov = OPENVORLA_NAMESPACE;

// Attribute objects declared as the host declares its own.
ov::VObject points(const char *name, const char *brief, bool computed);
ov::VObject number(const char *name, const char *brief, double value, double min, double max);
ov::VObject triple(const char *name, const char *brief, double value);
ov::VObject matrix(const char *name, const char *brief, bool computed);

struct Declared {
  std::vector<ov::VObject> attributes;
  std::vector<std::pair<ov::VObject, ov::VObject>> affects;
  // Outputs that the host asks the node itself for (a locator's bounding
  // box): every other attribute of the node affects them.
  std::vector<ov::VObject> askedOfNode;
};

// What the nodes of a VPxNode::Type have before the plug-in's own attributes.
Declared ofKind(int nodeKind);

// The host's value of a base attribute, computed for a node whose compute
// answered kUnknownParameter: a geometry filter's output through its
// deform(), a transform's matrix through its transformation matrix, a
// locator's bounding box through its boundingBox().
// kUnknownParameter when the host has none for the attribute. No lock held.
ov::VStatus compute(graph::Node &node, int attribute);

}  // namespace bases
}  // namespace standin
