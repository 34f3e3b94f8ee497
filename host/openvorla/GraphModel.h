// The dependency graph's model, shared by the sources of the graph: node
// types as their initializers declared them, nodes with their values, and
// the connections between them.
//
// Locking. One mutex guards the node table, the connections, the types and
// the per-node compute marks. It is never held across a call into a node (a
// compute, a constructor callback, a deletion): such a call may take the
// interpreter lock, and a thread holding that lock may be waiting for this
// mutex. Values live in data-block slots, each with its own mutex, which is
// only ever taken alone or after the graph's. Nodes are shared pointers, so a
// node being computed outlives its removal from the table; the last owner
// deletes the plug-in's node, never with the graph's mutex held.
#pragma once

#include <openvorla/VObject.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <standin/Graph.h>

#include <atomic>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <unordered_map>
#include <vector>

#include "DataBlockState.h"
#include "HostCalls.h"

namespace standin {
namespace graph {

namespace ov = OPENVORLA_NAMESPACE;

struct AttributeSpec {
  ov::VObject object;
  std::string name;
  std::string briefName;
  bool isString = false;
  int numericType = 0;
  int dataType = 0;       // VFnData::Type of its data: 0 number or string, kNumeric compound
  size_t components = 0;  // of a compound
  double defaultNumber = 0.0;
  std::string defaultText;
  bool readable = true;
  bool writable = true;
  bool hasMin = false;
  bool hasMax = false;
  double min = 0.0;
  double max = 0.0;
  // The node computes it: another attribute affects it, or it is not writable.
  bool computed = false;
  std::vector<int> affects;  // the attributes of the node that a change of it dirties
};

struct NodeType {
  std::string name;
  unsigned long serial = 0;               // of the registration whose initializer declared it
  std::vector<AttributeSpec> attributes;  // the parent's first, then in declaration order
  std::vector<std::vector<int>> affectedBy;  // per attribute, those whose change dirties it
  bool scripted = false;                     // its nodes are made by a script's creator
  std::string plugin;                        // the plug-in that registered it

  // By long or brief name, or by object; -1 when the type has none.
  int find(const std::string &name) const;
  int find(const ov::VObject &attribute) const;
};

class GraphState;
class Node;

struct Connection {
  Node *source;
  int sourceAttribute;
  Node *destination;
  int destinationAttribute;
};

class Node : public ov::DataBlockOwner {
 public:
  Node(GraphState &graph, std::string name, std::shared_ptr<const NodeType> type,
       ov::VPxNode *node);
  ~Node() override;  // deletes the plug-in's node

  // The block bound to this node, with each attribute at its default: inputs
  // clean, computed attributes dirty. Once, right after construction.
  void bind(const std::shared_ptr<Node> &self);

  ov::VStatus prepareRead(const ov::VObject &attribute) override;
  ov::VStatus checkAttribute(const ov::VObject &attribute) override;

  std::string plugName(int attribute) const {
    return name + "." + type->attributes[attribute].name;
  }
  std::shared_ptr<Node> shared() const { return fSelf.lock(); }

  GraphState &graph;
  const std::string name;
  const std::shared_ptr<const NodeType> type;
  ov::VPxNode *const node;
  unsigned long serial = 0;  // the order of creation
  ov::VDataBlock block;
  std::vector<std::shared_ptr<ov::VDataSlot>> slots;  // one per attribute of the type
  std::vector<char> computing;                        // under the graph's mutex
  std::atomic<long> computeCount{0};
  // Under the graph's mutex: the connections into and out of the node, and
  // per attribute the mark of the last walk that reached it.
  std::vector<Connection> in, out;
  std::vector<unsigned long> walked;

 private:
  std::weak_ptr<Node> fSelf;
};

using NodePtr = std::shared_ptr<Node>;


// What a thread does for evaluate(): its computes are noted, and it computes
// only the node it was given; a read of another dirty node's value takes the
// value as it is (the levels before have computed every source it reads).
class EvaluationRun {
 public:
  virtual ~EvaluationRun() = default;
  virtual void noteCompute() = 0;
};
struct EvaluationThread {
  EvaluationRun *run = nullptr;  // null outside evaluate()
  const Node *node = nullptr;
};
extern thread_local EvaluationThread tEvaluation;

class GraphState {
 public:
  GraphState() = default;
  GraphState(const GraphState &) = delete;
  GraphState &operator=(const GraphState &) = delete;

  // Under mutex.
  NodePtr findNode(const std::string &name) const;
  const Connection *incoming(const Node *node, int attribute) const;
  // Marks dirty what a change of the attribute's value affects: the node's
  // attributes it affects, and through connections everything downstream.
  // A value found dirty already has everything downstream of it dirty (a
  // value is only cleaned after what it depends on), so the walk stops there.
  void markDirty(Node *node, int attribute);
  void addNode(const NodePtr &node);
  void connectIndexed(const Connection &c);
  void disconnectIndexed(const Connection &c);
  // "node.attribute" to the node and the attribute's index.
  ov::VStatus parsePlug(const std::string &plug, NodePtr *node, int *attribute) const;
  // Whether a connection path leads from one node to the other.
  bool reaches(const Node *from, const Node *to) const;

  // With no lock held.
  // Brings the value up to date: first, in a loop, every dirty value it
  // depends on, upstream first (a connected input takes its source's value,
  // a computed one its node's compute), so that no compute has to pull
  // another from inside itself, however long the chain.
  ov::VStatus refresh(const NodePtr &node, int attribute);
  // One value, what it depends on up to date: a connected input takes its
  // source's value, a dirty computed one its node's compute.
  ov::VStatus bring(const NodePtr &node, int attribute);
  // Calls the node's compute for the dirty attribute; the attribute is clean
  // afterwards unless the compute failed.
  ov::VStatus compute(const NodePtr &node, int attribute);
  // The type, its initializer run before its first node of the type's
  // current registration.
  std::shared_ptr<const NodeType> nodeType(const std::string &typeName, ov::VStatus *status);
  // Disconnects the node from the others and takes it out of the table; the
  // caller drops the pointer (and so may delete the node) after the calls
  // into the other nodes are made.
  NodePtr remove(const std::string &name, ov::VStatus *status);
  NodePtr removeLocked(const std::string &name, ov::VStatus *status);  // under mutex

  mutable std::mutex mutex;
  std::map<unsigned long, NodePtr> nodes;  // by serial: in the order they were made
  std::unordered_map<std::string, NodePtr> byName;
  std::unordered_map<std::string, unsigned long> nextSuffix;  // per type, for made-up names
  unsigned long madeNodes = 0;
  unsigned long walks = 0;
  std::map<std::string, std::shared_ptr<const NodeType>> types;
  std::vector<int> lastThreads;
  std::mutex initializing;  // one initializer at a time: declarations are process-wide
};

using host::failure;
using host::guarded;
using host::quoted;

}  // namespace graph

struct Graph::Impl : graph::GraphState {};

}  // namespace standin
