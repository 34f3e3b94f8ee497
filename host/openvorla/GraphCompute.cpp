// Computing on demand: bringing a value up to date, from its source or by its
// node's compute, and the reads a compute makes through its data block.
#include <standin/Graph.h>
#include <standin/Objects.h>

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

VStatus GraphState::refresh(const NodePtr &node, int attribute) {
  NodePtr source;
  int sourceAttribute = -1;
  {
    std::lock_guard<std::mutex> guard(mutex);
    if (const Connection *c = incoming(node.get(), attribute)) {
      source = c->source->shared();
      sourceAttribute = c->sourceAttribute;
    }
  }
  VDataSlot &slot = *node->slots[attribute];
  if (source) {
    if (slot.isClean()) return VStatus::kSuccess;
    VStatus status = refresh(source, sourceAttribute);
    slot.copyFrom(*source->slots[sourceAttribute]);
    if (!status) slot.setClean(false);  // taken again once the source computes
    return status;
  }
  if (!node->type->attributes[attribute].computed || slot.isClean()) return VStatus::kSuccess;
  // While evaluate runs, a thread computes its own node only: the sources of
  // a node are computed on the levels before it.
  if (tEvaluation.run && tEvaluation.node != node.get()) return VStatus::kSuccess;
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
  VStatus status = guarded([&] { return node->node->compute(plug, node->block); });
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
