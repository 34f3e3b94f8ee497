// Computing on demand: bringing a value up to date, from its source or by its
// node's compute, and the reads a compute makes through its data block.
#include <standin/Graph.h>
#include <standin/Objects.h>

#include <set>
#include <utility>
#include <vector>

#include "BaseAttributes.h"
#include "GraphModel.h"

namespace standin {
namespace graph {

using namespace OPENVORLA_NAMESPACE;

thread_local EvaluationThread tEvaluation;

namespace {

// The compute running on this thread, innermost first: a read that finds its
// source failing taints the compute that made it.
struct ComputeFrame {
  const Node *node;
  ComputeFrame *outer;
  bool inputFailed = false;
  VStatus inputFailure;
};

thread_local ComputeFrame *tFrame = nullptr;

}  // namespace

namespace {

struct Step {
  NodePtr node;
  int attribute;
  bool expanded;
};

// While evaluate runs, a thread computes its own node only: the sources of
// a node are computed on the levels before it, and are taken as they are.
bool elsewhere(const Node *node) { return tEvaluation.run && tEvaluation.node != node; }

}  // namespace

VStatus GraphState::refresh(const NodePtr &node, int attribute) {
  if (node->slots[attribute]->isClean()) return VStatus::kSuccess;
  // Depth first, each value after the dirty values it depends on: a
  // connected input on its source, a computed attribute on the node's
  // attributes that affect it.
  std::vector<Step> stack{{node, attribute, false}};
  std::set<std::pair<const Node *, int>> seen{{node.get(), attribute}};
  while (!stack.empty()) {
    if (!stack.back().expanded) {
      stack.back().expanded = true;
      NodePtr n = stack.back().node;
      int a = stack.back().attribute;
      std::vector<std::pair<NodePtr, int>> depends;
      if (!elsewhere(n.get())) {
        std::lock_guard<std::mutex> guard(mutex);
        if (const Connection *c = incoming(n.get(), a))
          depends.push_back({c->source->shared(), c->sourceAttribute});
        else if (n->type->attributes[a].computed)
          for (int b : n->type->affectedBy[a]) depends.push_back({n, b});
      }
      for (auto &[dn, da] : depends)
        if (dn && !dn->slots[da]->isClean() && seen.insert({dn.get(), da}).second)
          stack.push_back({std::move(dn), da, false});
      continue;
    }
    Step step = std::move(stack.back());
    stack.pop_back();
    VStatus status = bring(step.node, step.attribute);
    // What depends on a failed value fails with it, and is not computed.
    if (!status) return status;
  }
  return VStatus::kSuccess;
}

VStatus GraphState::bring(const NodePtr &node, int attribute) {
  VDataSlot &slot = *node->slots[attribute];
  if (slot.isClean()) return VStatus::kSuccess;
  NodePtr source;
  int sourceAttribute = -1;
  {
    std::lock_guard<std::mutex> guard(mutex);
    if (const Connection *c = incoming(node.get(), attribute)) {
      source = c->source->shared();
      sourceAttribute = c->sourceAttribute;
    }
  }
  if (source) {
    slot.copyFrom(*source->slots[sourceAttribute]);
    // Taken again once the source has computed.
    if (!source->slots[sourceAttribute]->isClean()) slot.setClean(false);
    return VStatus::kSuccess;
  }
  if (!node->type->attributes[attribute].computed || elsewhere(node.get()))
    return VStatus::kSuccess;
  return compute(node, attribute);
}

// "unknown" from the compute is the host's default, which for an output
// leaves the value as it is. A failed compute leaves the value dirty, so that
// the next read computes again.
VStatus GraphState::compute(const NodePtr &node, int attribute) {
  {
    std::lock_guard<std::mutex> guard(mutex);
    // Asked again while computing (a compute reading its own output): the
    // value is what it is so far.
    if (node->computing[attribute] || node->slots[attribute]->isClean()) return VStatus::kSuccess;
    node->computing[attribute] = 1;
  }
  const AttributeSpec &spec = node->type->attributes[attribute];
  VPlug plug(node->node->thisVObject(), spec.object);
  ComputeFrame frame{node.get(), tFrame, false, VStatus()};
  tFrame = &frame;
  ++node->computeCount;
  if (tEvaluation.run) tEvaluation.run->noteCompute();
  auto computing = [&] {
    return Operation::Description{node->type->plugin,
                                  "computing " + quoted(node->plugName(attribute))};
  };
  VStatus status = host::inPlugin(node->node, "compute", computing,
                                  [&] { return node->node->compute(plug, node->block); });
  // Left to the host: what the node's kind computes, if anything.
  if (status == VStatus::kUnknownParameter && !frame.inputFailed) {
    VStatus made = host::inPlugin(node->node, nullptr, computing,
                                  [&] { return bases::compute(*node, attribute); });
    if (made != VStatus::kUnknownParameter) status = made;
  }
  tFrame = frame.outer;
  {
    std::lock_guard<std::mutex> guard(mutex);
    node->computing[attribute] = 0;
  }
  // A compute made from a failed input failed with it, whatever it says.
  if (frame.inputFailed) return frame.inputFailure;
  if (status || status == VStatus::kUnknownParameter) {
    node->slots[attribute]->setClean(true);
    return VStatus::kSuccess;
  }
  return failure(status.statusCode(), "Computing " + quoted(node->plugName(attribute)) +
                                          " failed: " + status.errorString().asUTF8());
}

VStatus Node::checkAttribute(const VObject &attribute) {
  if (type->find(attribute) >= 0) return VStatus::kSuccess;
  return failure(VStatus::kInvalidParameter, "The node " + quoted(name) + " has no attribute " +
                                                 quoted(standin::objectName(attribute)));
}

VStatus Node::prepareRead(const VObject &attribute) {
  int a = type->find(attribute);
  NodePtr self = fSelf.lock();
  if (a < 0 || !self) return checkAttribute(attribute);
  VStatus status = graph.refresh(self, a);
  if (!status && tFrame && tFrame->node == this && !tFrame->inputFailed) {
    tFrame->inputFailed = true;
    tFrame->inputFailure = status;
  }
  return status;
}

}  // namespace graph
}  // namespace standin
