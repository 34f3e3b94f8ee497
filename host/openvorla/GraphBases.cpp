// The base attributes of node kinds, and what the host computes for them.
#include <openvorla/VEulerRotation.h>
#include <openvorla/VFnData.h>
#include <openvorla/VFnNumericData.h>
#include <openvorla/VItGeometry.h>
#include <openvorla/VPxGeometryFilter.h>
#include <openvorla/VPxLocatorNode.h>
#include <openvorla/VPxTransform.h>

#include "AttributeSets.h"
#include "BaseAttributes.h"
#include "GraphModel.h"

namespace standin {
namespace bases {

using namespace OPENVORLA_NAMESPACE;

namespace {

VObject declare(const char *name, const char *brief, AttributeInfo info) {
  return attributes::make(name, brief, info, nullptr);
}

std::vector<double> numbersOf(VDataSlot &slot, int dataType) {
  std::lock_guard<std::mutex> guard(slot.mutex);
  return slot.dataType == dataType ? slot.numbers : std::vector<double>();
}

VStatus deformed(graph::Node &node, VPxGeometryFilter &filter, int output) {
  const graph::NodeType &type = *node.type;
  int input = type.find(VPxGeometryFilter::inputGeom);
  if (input < 0) return VStatus::kUnknownParameter;
  std::vector<double> in = numbersOf(*node.slots[input], VFnData::kPointArray);
  VPointArray points;
  for (size_t i = 0; i + 2 < in.size(); i += 3) points.append(VPoint(in[i], in[i + 1], in[i + 2]));
  VItGeometry iter(points);
  VStatus status = filter.deform(node.block, iter, VMatrix(), 0);
  if (!status) return status;
  iter.allPositions(points);
  std::vector<double> out;
  for (unsigned int i = 0; i < points.length(); ++i)
    out.insert(out.end(), {points[i].x, points[i].y, points[i].z});
  node.slots[output]->setNumbers(VFnData::kPointArray, std::move(out), true);
  return VStatus::kSuccess;
}

// A three-number attribute of the node as a vector.
VVector component(graph::Node &node, const VObject &attribute, double otherwise) {
  int a = node.type->find(attribute);
  std::vector<double> n =
      a < 0 ? std::vector<double>() : numbersOf(*node.slots[a], VFnData::kNumeric);
  return n.size() == 3 ? VVector(n[0], n[1], n[2]) : VVector(otherwise, otherwise, otherwise);
}

// The locator's box, scaled by its local scale and moved to its local
// position; a point at its position when it is not bounded.
VStatus bounded(graph::Node &node, VPxLocatorNode &locator) {
  VVector at = component(node, VPxLocatorNode::localPosition, 0.0);
  VVector scale = component(node, VPxLocatorNode::localScale, 1.0);
  VPoint low(at.x, at.y, at.z), high = low;
  if (locator.isBounded()) {
    VBoundingBox box = locator.boundingBox();
    VPoint a = box.min(), b = box.max();
    low = VPoint(at.x + a.x * scale.x, at.y + a.y * scale.y, at.z + a.z * scale.z);
    high = VPoint(at.x + b.x * scale.x, at.y + b.y * scale.y, at.z + b.z * scale.z);
  }
  for (const auto &[attribute, p] : {std::make_pair(VPxLocatorNode::nodeBoundingBoxMin, low),
                                     std::make_pair(VPxLocatorNode::nodeBoundingBoxMax, high)}) {
    int slot = node.type->find(attribute);
    if (slot >= 0) node.slots[slot]->setNumbers(VFnData::kNumeric, {p.x, p.y, p.z}, true);
  }
  return VStatus::kSuccess;
}

VStatus composed(graph::Node &node, VPxTransform &transform, int output) {
  auto component = [&](const VObject &attribute, double otherwise) {
    return standin::bases::component(node, attribute, otherwise);
  };
  VPxTransformationMatrix &m = transform.transformationMatrix();
  VVector r = component(VPxTransform::rotate, 0.0);
  VStatus status = m.translateTo(component(VPxTransform::translate, 0.0));
  if (status) status = m.rotateTo(VEulerRotation(r.x, r.y, r.z));
  if (status) status = m.scaleTo(component(VPxTransform::scale, 1.0));
  if (!status) return status;
  VMatrix composed = m.asMatrix();
  std::vector<double> out(16);
  for (int i = 0; i < 16; ++i) out[i] = composed(i / 4, i % 4);
  node.slots[output]->setNumbers(VFnData::kMatrix, std::move(out), true);
  return VStatus::kSuccess;
}

}  // namespace

VObject points(const char *name, const char *brief, bool computed) {
  AttributeInfo info;
  info.dataType = VFnData::kPointArray;
  info.writable = !computed;
  return declare(name, brief, info);
}

VObject number(const char *name, const char *brief, double value, double min, double max) {
  AttributeInfo info;
  info.numericType = VFnNumericData::kDouble;
  info.defaultNumber = value;
  info.hasMin = info.hasMax = true;
  info.min = min;
  info.max = max;
  return declare(name, brief, info);
}

VObject triple(const char *name, const char *brief, double value) {
  AttributeInfo info;
  info.numericType = VFnNumericData::k3Double;
  info.defaultNumber = value;
  return declare(name, brief, info);
}

VObject matrix(const char *name, const char *brief, bool computed) {
  AttributeInfo info;
  info.dataType = VFnData::kMatrix;
  info.writable = !computed;
  return declare(name, brief, info);
}

Declared ofKind(int nodeKind) {
  switch (nodeKind) {
    case VPxNode::kDeformerNode:
    case VPxNode::kGeometryFilter:
    case VPxNode::kSkinCluster:
    case VPxNode::kBlendShape:
      return {{VPxGeometryFilter::inputGeom, VPxGeometryFilter::envelope,
               VPxGeometryFilter::outputGeom},
              {{VPxGeometryFilter::inputGeom, VPxGeometryFilter::outputGeom},
               {VPxGeometryFilter::envelope, VPxGeometryFilter::outputGeom}},
              {}};
    case VPxNode::kTransformNode:
      return {{VPxTransform::translate, VPxTransform::rotate, VPxTransform::scale,
               VPxTransform::matrix},
              {{VPxTransform::translate, VPxTransform::matrix},
               {VPxTransform::rotate, VPxTransform::matrix},
               {VPxTransform::scale, VPxTransform::matrix}},
              {}};
    case VPxNode::kLocatorNode:
      return {{VPxLocatorNode::localPosition, VPxLocatorNode::localScale,
               VPxLocatorNode::nodeBoundingBoxMin, VPxLocatorNode::nodeBoundingBoxMax},
              {},
              {VPxLocatorNode::nodeBoundingBoxMin, VPxLocatorNode::nodeBoundingBoxMax}};
    default:
      return {};
  }
}

VStatus compute(graph::Node &node, int attribute) {
  const VObject &object = node.type->attributes[attribute].object;
  if (object == VPxGeometryFilter::outputGeom)
    if (auto *filter = dynamic_cast<VPxGeometryFilter *>(node.node))
      return deformed(node, *filter, attribute);
  if (object == VPxTransform::matrix)
    if (auto *transform = dynamic_cast<VPxTransform *>(node.node))
      return composed(node, *transform, attribute);
  if (object == VPxLocatorNode::nodeBoundingBoxMin || object == VPxLocatorNode::nodeBoundingBoxMax)
    if (auto *locator = dynamic_cast<VPxLocatorNode *>(node.node)) return bounded(node, *locator);
  return VStatus::kUnknownParameter;
}

}  // namespace bases
}  // namespace standin
