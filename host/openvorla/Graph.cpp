// The dependency graph's nodes: node types initialized once from their
// declarations, nodes made through their creators and owned by the graph.
#include <standin/Graph.h>
#include <standin/Nodes.h>
#include <standin/Objects.h>
#include <standin/Registry.h>
#include <openvorla/VFnData.h>
#include <openvorla/VFnNumericData.h>

#include <algorithm>
#include <cctype>
#include <set>
#include <utility>

#include "BaseAttributes.h"
#include "GraphModel.h"
#include "ObjectRecords.h"

namespace standin {

using namespace OPENVORLA_NAMESPACE;

namespace graph {

int NodeType::find(const std::string &name) const {
  for (size_t i = 0; i < attributes.size(); ++i)
    if (attributes[i].name == name) return static_cast<int>(i);
  for (size_t i = 0; i < attributes.size(); ++i)
    if (attributes[i].briefName == name) return static_cast<int>(i);
  return -1;
}

int NodeType::find(const VObject &attribute) const {
  for (size_t i = 0; i < attributes.size(); ++i)
    if (attributes[i].object == attribute) return static_cast<int>(i);
  return -1;
}

Node::Node(GraphState &g, std::string n, std::shared_ptr<const NodeType> t, VPxNode *made)
    : graph(g), name(std::move(n)), type(std::move(t)), node(made) {}

Node::~Node() {
  try {
    standin::deleteNode(node);
  } catch (...) {  // a destructor of plug-in code has nowhere to report to
  }
}

void Node::bind(const std::shared_ptr<Node> &self) {
  fSelf = self;
  block = VDataBlockAccess::bound(std::weak_ptr<DataBlockOwner>(self));
  for (const AttributeSpec &spec : type->attributes) {
    std::shared_ptr<VDataSlot> slot = VDataBlockAccess::slot(block, spec.object);
    if (spec.isString)
      slot->setText(spec.defaultText, !spec.computed);
    else if (spec.dataType == VFnData::kNumeric)
      slot->setNumbers(spec.dataType, std::vector<double>(spec.components, spec.defaultNumber),
                       !spec.computed);
    else if (spec.dataType == VFnData::kMatrix)
      slot->setNumbers(spec.dataType, {1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1, 0, 0, 0, 0, 1},
                       !spec.computed);
    else if (spec.dataType)
      slot->setNumbers(spec.dataType, {}, !spec.computed);
    else
      slot->setNumber(spec.defaultNumber, !spec.computed);
    slots.push_back(std::move(slot));
  }
  computing.assign(slots.size(), 0);
  walked.assign(slots.size(), 0);
}

NodePtr GraphState::findNode(const std::string &name) const {
  auto it = byName.find(name);
  return it == byName.end() ? nullptr : it->second;
}

void GraphState::addNode(const NodePtr &node) {
  node->serial = ++madeNodes;
  nodes.emplace(node->serial, node);
  byName.emplace(node->name, node);
}

VStatus GraphState::parsePlug(const std::string &plug, NodePtr *node, int *attribute) const {
  std::string::size_type dot = plug.find('.');
  if (dot == std::string::npos || dot == 0 || dot + 1 == plug.size())
    return failure(VStatus::kInvalidParameter,
                   quoted(plug) + " is not a plug: a plug is named node.attribute");
  std::string nodeName = plug.substr(0, dot), attributeName = plug.substr(dot + 1);
  *node = findNode(nodeName);
  if (!*node) return failure(VStatus::kNotFound, "No node is named " + quoted(nodeName));
  *attribute = (*node)->type->find(attributeName);
  if (*attribute < 0)
    return failure(VStatus::kNotFound,
                   "The node " + quoted(nodeName) + " has no attribute " + quoted(attributeName));
  return VStatus::kSuccess;
}

namespace {

AttributeSpec specOf(const VObject &object) {
  AttributeInfo info;
  VObjectFactory::attributeInfo(object, &info);
  AttributeSpec spec;
  spec.object = object;
  spec.name = VObjectFactory::name(object);
  spec.briefName = info.briefName;
  spec.isString = info.isString;
  spec.numericType = info.numericType;
  spec.dataType = info.isString ? 0 : info.dataType;
  switch (info.numericType) {
    case VFnNumericData::k2Float:
    case VFnNumericData::k2Double:
      spec.components = 2;
      break;
    case VFnNumericData::k3Float:
    case VFnNumericData::k3Double:
      spec.components = 3;
      break;
    case VFnNumericData::k4Double:
      spec.components = 4;
      break;
  }
  if (spec.components) spec.dataType = VFnData::kNumeric;
  spec.defaultNumber = info.defaultNumber;
  spec.defaultText = info.defaultText;
  spec.readable = info.readable;
  spec.writable = info.writable;
  spec.hasMin = info.hasMin;
  spec.hasMax = info.hasMax;
  spec.min = info.min;
  spec.max = info.max;
  spec.computed = !info.writable;
  return spec;
}

bool isNodeName(const std::string &name) {
  if (name.empty() || std::isdigit(static_cast<unsigned char>(name[0]))) return false;
  for (char c : name)
    if (!std::isalnum(static_cast<unsigned char>(c)) && c != '_') return false;
  return true;
}

}  // namespace

// The initializer runs with the graph's mutex free, as it may be a script;
// `initializing` keeps a second type's declarations from mixing with its own.
// A type that inherits is built on its parent's, initialized first. A type
// registered anew (its plug-in reloaded) is initialized anew; the nodes made
// before keep the declarations they were made with.
std::shared_ptr<const NodeType> GraphState::nodeType(const std::string &typeName, VStatus *status) {
  auto known = [&]() -> std::shared_ptr<const NodeType> {
    unsigned long serial = standin::nodeTypeSerial(typeName.c_str());
    std::lock_guard<std::mutex> guard(mutex);
    auto it = types.find(typeName);
    return it == types.end() || it->second->serial != serial ? nullptr : it->second;
  };
  if (auto type = known()) return type;
  std::unique_lock<std::mutex> init(initializing);
  if (auto type = known()) return type;
  const unsigned long serial = standin::nodeTypeSerial(typeName.c_str());
  *status = guarded([&] { return standin::initializeNode(typeName.c_str()); });
  if (!*status) return nullptr;
  NodeTypeDeclaration declared = standin::nodeTypeDeclaration();
  init.unlock();

  auto type = std::make_shared<NodeType>();
  type->name = typeName;
  type->serial = serial;
  // Whether a script's creator makes the nodes.
  for (const RegistrationInfo &r : standin::registrations())
    if (r.name == typeName && (r.kind == "Node" || r.kind == "Shape" || r.kind == "Transform")) {
      type->plugin = r.plugin;
      for (const RegisteredCallback &c : r.callbacks)
        if (c.role == "creator" && c.script) type->scripted = true;
    }
  if (!declared.parent.empty()) {
    std::shared_ptr<const NodeType> parent = nodeType(declared.parent, status);
    if (!parent) return nullptr;
    type->attributes = parent->attributes;
  }
  // The attributes the kind's proxy class gives its nodes come first.
  bases::Declared base = bases::ofKind(standin::nodeKind(typeName));
  for (const VObject &object : base.attributes)
    if (type->find(object) < 0) type->attributes.push_back(specOf(object));
  for (const VObject &object : declared.attributes)
    if (type->find(object) < 0) type->attributes.push_back(specOf(object));
  for (const VObject &output : base.askedOfNode)
    for (const AttributeSpec &spec : type->attributes)
      if (std::find(base.askedOfNode.begin(), base.askedOfNode.end(), spec.object) ==
          base.askedOfNode.end())
        declared.affects.push_back({spec.object, output});
  declared.affects.insert(declared.affects.end(), base.affects.begin(), base.affects.end());
  for (const auto &affects : declared.affects) {
    int from = type->find(affects.first), to = type->find(affects.second);
    if (from < 0 || to < 0 || from == to) continue;
    type->attributes[from].affects.push_back(to);
    type->attributes[to].computed = true;
  }
  type->affectedBy.assign(type->attributes.size(), {});
  for (size_t from = 0; from < type->attributes.size(); ++from)
    for (int to : type->attributes[from].affects)
      type->affectedBy[to].push_back(static_cast<int>(from));
  std::lock_guard<std::mutex> guard(mutex);
  types[typeName] = type;
  return type;
}

NodePtr GraphState::remove(const std::string &name, VStatus *status) {
  std::lock_guard<std::mutex> guard(mutex);
  return removeLocked(name, status);
}

NodePtr GraphState::removeLocked(const std::string &name, VStatus *status) {
  auto found = byName.find(name);
  if (found == byName.end()) {
    *status = failure(VStatus::kNotFound, "No node is named " + quoted(name));
    return nullptr;
  }
  NodePtr node = std::move(found->second);
  byName.erase(found);
  nodes.erase(node->serial);
  for (const Connection &c : std::vector<Connection>(node->in)) disconnectIndexed(c);
  // Downstream values stay as they were last taken, and clean.
  for (const Connection &c : std::vector<Connection>(node->out)) {
    disconnectIndexed(c);
    c.destination->slots[c.destinationAttribute]->setClean(true);
    markDirty(c.destination, c.destinationAttribute);
  }
  *status = VStatus::kSuccess;
  return node;
}

}  // namespace graph

Graph::Graph() : impl_(new Impl) {}

// Never destroyed: nodes still in the graph at exit may be directors, whose
// deletion needs an interpreter that is gone by then.
Graph &Graph::instance() {
  static Graph *graph = new Graph;
  return *graph;
}

VStatus Graph::createNode(const std::string &type, const std::string &name, std::string *made) {
  using graph::failure;
  using graph::quoted;
  if (!name.empty() && !graph::isNodeName(name))
    return failure(VStatus::kInvalidParameter,
                   quoted(name) +
                       " is not a node name: letters, digits and '_', not starting "
                       "with a digit");
  if (!name.empty()) {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    if (impl_->findNode(name))
      return failure(VStatus::kFailure, "A node named " + quoted(name) + " already exists");
  }
  VStatus status;
  std::shared_ptr<const graph::NodeType> nodeType = impl_->nodeType(type, &status);
  if (!nodeType) return status;
  VPxNode *raw = nullptr;
  status = host::inPluginVoid(
      nullptr, nullptr,
      [&] {
        return Operation::Description{nodeType->plugin,
                                      "creating a node of the type " + quoted(type)};
      },
      [&] { raw = standin::createNode(type.c_str()); });
  if (!raw)
    return host::madeNone("The creator of the node type " + quoted(type) + " made no node", status);

  graph::NodePtr node;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    std::string chosen = name;
    // A made-up name: the type's name and the next number not taken, which
    // each type remembers, so that naming costs the same in any scene.
    for (unsigned long &n = impl_->nextSuffix[type]; chosen.empty();) {
      std::string candidate = type + std::to_string(++n);
      if (!impl_->findNode(candidate)) chosen = candidate;
    }
    if (!impl_->findNode(chosen)) {
      standin::setNodeIdentity(*raw, makeObject(raw->thisVObject().apiType(), chosen.c_str()),
                               type.c_str(), raw->typeId());
      node = std::make_shared<graph::Node>(*impl_, chosen, nodeType, raw);
      node->bind(node);
      impl_->addNode(node);
    }
  }
  if (!node) {  // taken meanwhile by another thread
    standin::deleteNode(raw);
    return failure(VStatus::kFailure, "A node named " + quoted(name) + " already exists");
  }
  // The node is made whatever its postConstructor does; a failure is in the log.
  host::inPluginVoid(
      raw, "postConstructor",
      [&] {
        return Operation::Description{nodeType->plugin, "creating the node " + quoted(node->name)};
      },
      [&] { raw->postConstructor(); });
  if (made) *made = node->name;
  return VStatus::kSuccess;
}

VStatus Graph::deleteNode(const std::string &name) {
  VStatus status;
  graph::NodePtr node = impl_->remove(name, &status);
  return status;  // the node goes with the last pointer to it, here or after a compute
}

void Graph::deleteNodesOfPlugin(const std::string &plugin) {
  std::vector<std::string> typeNames;
  for (const RegistrationInfo &r : standin::registrations())
    if (r.plugin == plugin && (r.kind == "Node" || r.kind == "Shape" || r.kind == "Transform"))
      typeNames.push_back(r.name);
  std::set<std::string> kinds(typeNames.begin(), typeNames.end());
  std::vector<graph::NodePtr> doomed;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    for (const auto &entry : impl_->nodes)
      if (kinds.count(entry.second->type->name)) doomed.push_back(entry.second);
    VStatus status;
    for (const graph::NodePtr &n : doomed) impl_->removeLocked(n->name, &status);
    // The plug-in may come back with other declarations.
    for (const std::string &t : typeNames) impl_->types.erase(t);
  }
  doomed.clear();  // deletes the nodes, with no lock held
}

std::vector<NodeInfo> Graph::nodes() const {
  std::lock_guard<std::mutex> guard(impl_->mutex);
  std::vector<NodeInfo> out;
  for (const auto &entry : impl_->nodes) {
    const graph::NodePtr &n = entry.second;
    NodeInfo info;
    info.name = n->name;
    info.type = n->type->name;
    for (const graph::AttributeSpec &a : n->type->attributes) info.attributes.push_back(a.name);
    info.computeCount = n->computeCount.load();
    out.push_back(std::move(info));
  }
  return out;
}

void Graph::clear() {
  std::vector<graph::NodePtr> doomed;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    for (auto &entry : impl_->nodes) {
      entry.second->in.clear();
      entry.second->out.clear();
      doomed.push_back(std::move(entry.second));
    }
    impl_->nodes.clear();
    impl_->byName.clear();
    impl_->nextSuffix.clear();
  }
  doomed.clear();  // deletes the nodes, with no lock held
}

}  // namespace standin
