// The dependency graph's plugs: setting and getting values, connections, and
// the dirty marks that a change sends downstream.
#include <standin/Graph.h>

#include <algorithm>
#include <set>
#include <utility>

#include <openvorla/VFnData.h>

#include "AttributeSets.h"
#include "GraphModel.h"

namespace standin {

using namespace OPENVORLA_NAMESPACE;
using graph::failure;
using graph::quoted;

namespace graph {

const Connection *GraphState::incoming(const Node *node, int attribute) const {
  for (const Connection &c : node->in)
    if (c.destinationAttribute == attribute) return &c;
  return nullptr;
}

void GraphState::connectIndexed(const Connection &c) {
  c.source->out.push_back(c);
  c.destination->in.push_back(c);
}

void GraphState::disconnectIndexed(const Connection &c) {
  auto same = [&](const Connection &o) {
    return o.source == c.source && o.sourceAttribute == c.sourceAttribute &&
           o.destination == c.destination && o.destinationAttribute == c.destinationAttribute;
  };
  auto &out = c.source->out;
  out.erase(std::remove_if(out.begin(), out.end(), same), out.end());
  auto &in = c.destination->in;
  in.erase(std::remove_if(in.begin(), in.end(), same), in.end());
}

void GraphState::markDirty(Node *node, int attribute) {
  const unsigned long walk = ++walks;
  std::vector<std::pair<Node *, int>> work{{node, attribute}};
  node->walked[attribute] = walk;
  auto reach = [&](Node *n, int a) {
    if (n->walked[a] == walk) return;
    n->walked[a] = walk;
    if (!n->slots[a]->isClean()) return;  // and so is everything after it
    n->slots[a]->setClean(false);
    work.push_back({n, a});
  };
  while (!work.empty()) {
    auto [n, a] = work.back();
    work.pop_back();
    for (int affected : n->type->attributes[a].affects) reach(n, affected);
    for (const Connection &c : n->out)
      if (c.sourceAttribute == a) reach(c.destination, c.destinationAttribute);
  }
}

bool GraphState::reaches(const Node *from, const Node *to) const {
  std::vector<const Node *> work{from};
  std::set<const Node *> seen{from};
  while (!work.empty()) {
    const Node *n = work.back();
    work.pop_back();
    if (n == to) return true;
    for (const Connection &c : n->out)
      if (seen.insert(c.destination).second) work.push_back(c.destination);
  }
  return false;
}

}  // namespace graph

namespace {

const char *holds(bool isString) { return isString ? "a string" : "a number"; }

// What an attribute holds, in words.
std::string holds(const graph::AttributeSpec &spec) {
  switch (spec.dataType) {
    case 0:
      return holds(spec.isString);
    case VFnData::kNumeric:
      return std::to_string(spec.components) + " numbers";
    case VFnData::kMatrix:
      return "a matrix (4 rows of 4 numbers)";
    case VFnData::kDoubleArray:
      return "an array of numbers";
    case VFnData::kIntArray:
      return "an array of integers";
    case VFnData::kPointArray:
      return "an array of points (lists of 3 numbers)";
    default:
      return "an array of vectors (lists of 3 numbers)";
  }
}

std::string given(const Value &value) {
  if (!value.isList) return holds(value.isString);
  if (value.width) return "lists of " + std::to_string(value.width) + " numbers";
  return "a list of " + std::to_string(value.numbers.size()) + " numbers";
}

// The numbers of a list as the attribute holds them; false when the list has
// not its shape.
bool fits(const graph::AttributeSpec &spec, const Value &value) {
  if (!value.isList) return !spec.dataType && value.isString == spec.isString;
  const size_t n = value.numbers.size();
  switch (spec.dataType) {
    case VFnData::kNumeric:
      return !value.width && n == spec.components;
    case VFnData::kMatrix:
      return n == 16 && (value.width == 4 || value.width == 0);
    case VFnData::kDoubleArray:
      return !value.width || !n;
    case VFnData::kIntArray:
      return (!value.width || !n) &&
             std::all_of(value.numbers.begin(), value.numbers.end(),
                         [](double v) { return v == static_cast<double>(static_cast<int>(v)); });
    case VFnData::kPointArray:
    case VFnData::kVectorArray:
      return value.width == 3 || !n;
    default:
      return false;
  }
}

// The number as the attribute keeps it: of its type, within its range.
double stored(const graph::AttributeSpec &spec, double value) {
  value = attributes::numericValue(spec.numericType, value);
  if (spec.hasMin && value < spec.min) value = spec.min;
  if (spec.hasMax && value > spec.max) value = spec.max;
  return value;
}

// Tells a node of a connection made or broken: what it answers is its own to
// know, and a failure is in the log.
template <typename Call>
void tell(const graph::Node &node, const char *method, const std::string &doing, Call call) {
  host::inPlugin(
      node.node, method,
      [&] {
        return Operation::Description{node.type->plugin, doing};
      },
      call);
}

}  // namespace

VStatus Graph::setAttr(const std::string &plug, const Value &value) {
  std::lock_guard<std::mutex> guard(impl_->mutex);
  graph::NodePtr node;
  int a;
  VStatus status = impl_->parsePlug(plug, &node, &a);
  if (!status) return status;
  const graph::AttributeSpec &spec = node->type->attributes[a];
  std::string name = node->plugName(a);
  if (!spec.writable)
    return failure(VStatus::kFailure, "The plug " + quoted(name) + " is not writable");
  if (const graph::Connection *c = impl_->incoming(node.get(), a))
    return failure(VStatus::kFailure, "The plug " + quoted(name) + " takes its value from " +
                                          quoted(c->source->plugName(c->sourceAttribute)));
  if (!fits(spec, value))
    return failure(VStatus::kInvalidParameter,
                   "The plug " + quoted(name) + " holds " + holds(spec) + ", not " + given(value));
  if (spec.isString) {
    node->slots[a]->setText(value.text, true);
  } else if (spec.dataType) {
    std::vector<double> numbers = value.numbers;
    if (spec.dataType == VFnData::kNumeric)
      for (double &n : numbers) n = stored(spec, n);
    node->slots[a]->setNumbers(spec.dataType, std::move(numbers), true);
  } else {
    node->slots[a]->setNumber(stored(spec, value.number), true);
  }
  impl_->markDirty(node.get(), a);
  return VStatus::kSuccess;
}

VStatus Graph::getAttr(const std::string &plug, Value *value) {
  graph::NodePtr node;
  int a;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    VStatus status = impl_->parsePlug(plug, &node, &a);
    if (!status) return status;
  }
  VStatus status = impl_->refresh(node, a);
  if (!status) return status;
  VDataSlot &slot = *node->slots[a];
  std::lock_guard<std::mutex> guard(slot.mutex);
  const graph::AttributeSpec &spec = node->type->attributes[a];
  value->isString = spec.isString;
  value->number = value->isString || slot.isText ? 0.0 : slot.number;
  value->text = value->isString && slot.isText ? slot.text.asUTF8() : "";
  if (spec.dataType) {
    value->isList = true;
    value->dataType = spec.dataType;
    // A compute that set another kind of value leaves the attribute's own empty.
    value->numbers = slot.dataType == spec.dataType ? slot.numbers : std::vector<double>();
    value->width = spec.dataType == VFnData::kPointArray || spec.dataType == VFnData::kVectorArray
                       ? 3
                   : spec.dataType == VFnData::kMatrix ? 4
                                                       : 0;
  }
  return VStatus::kSuccess;
}

VStatus Graph::connect(const std::string &source, const std::string &destination) {
  graph::NodePtr from, to;
  int fromAttribute, toAttribute;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    VStatus status = impl_->parsePlug(source, &from, &fromAttribute);
    if (status) status = impl_->parsePlug(destination, &to, &toAttribute);
    if (!status) return status;
    const graph::AttributeSpec &fromSpec = from->type->attributes[fromAttribute];
    const graph::AttributeSpec &toSpec = to->type->attributes[toAttribute];
    std::string fromName = from->plugName(fromAttribute), toName = to->plugName(toAttribute);
    if (!fromSpec.readable)
      return failure(VStatus::kFailure,
                     "The plug " + quoted(fromName) + " is not readable: it is no source");
    if (!toSpec.writable)
      return failure(VStatus::kFailure,
                     "The plug " + quoted(toName) + " is not writable: it is no destination");
    if (holds(fromSpec) != holds(toSpec))
      return failure(VStatus::kInvalidParameter, "Cannot connect " + quoted(fromName) +
                                                     ", which holds " + holds(fromSpec) +
                                                     ", to " + quoted(toName) + ", which holds " +
                                                     holds(toSpec));
    if (const graph::Connection *c = impl_->incoming(to.get(), toAttribute))
      return failure(VStatus::kFailure,
                     c->source == from.get() && c->sourceAttribute == fromAttribute
                         ? quoted(fromName) + " is already connected to " + quoted(toName)
                         : "The plug " + quoted(toName) + " already takes its value from " +
                               quoted(c->source->plugName(c->sourceAttribute)));
    if (from == to || impl_->reaches(to.get(), from.get()))
      return failure(VStatus::kFailure, "Connecting " + quoted(fromName) + " to " + quoted(toName) +
                                            " would make a cycle");
    impl_->connectIndexed({from.get(), fromAttribute, to.get(), toAttribute});
    to->slots[toAttribute]->setClean(false);
    impl_->markDirty(to.get(), toAttribute);
  }
  VPlug fromPlug(from->node->thisVObject(), from->type->attributes[fromAttribute].object);
  VPlug toPlug(to->node->thisVObject(), to->type->attributes[toAttribute].object);
  // What the nodes answer is theirs to know; the connection stands.
  const std::string doing = "connecting " + quoted(source) + " to " + quoted(destination);
  tell(*from, "connectionMade", doing,
       [&] { return from->node->connectionMade(fromPlug, toPlug, true); });
  tell(*to, "connectionMade", doing,
       [&] { return to->node->connectionMade(toPlug, fromPlug, false); });
  return VStatus::kSuccess;
}

VStatus Graph::disconnect(const std::string &source, const std::string &destination) {
  graph::NodePtr from, to;
  int fromAttribute, toAttribute;
  {
    std::lock_guard<std::mutex> guard(impl_->mutex);
    VStatus status = impl_->parsePlug(source, &from, &fromAttribute);
    if (status) status = impl_->parsePlug(destination, &to, &toAttribute);
    if (!status) return status;
    const graph::Connection *c = impl_->incoming(to.get(), toAttribute);
    if (!c || c->source != from.get() || c->sourceAttribute != fromAttribute)
      return failure(VStatus::kFailure, quoted(from->plugName(fromAttribute)) +
                                            " is not connected to " +
                                            quoted(to->plugName(toAttribute)));
    impl_->disconnectIndexed(graph::Connection(*c));
    // The destination keeps the value it last took from the source.
    to->slots[toAttribute]->setClean(true);
    impl_->markDirty(to.get(), toAttribute);
  }
  VPlug fromPlug(from->node->thisVObject(), from->type->attributes[fromAttribute].object);
  VPlug toPlug(to->node->thisVObject(), to->type->attributes[toAttribute].object);
  const std::string doing = "disconnecting " + quoted(source) + " from " + quoted(destination);
  tell(*from, "connectionBroken", doing,
       [&] { return from->node->connectionBroken(fromPlug, toPlug, true); });
  tell(*to, "connectionBroken", doing,
       [&] { return to->node->connectionBroken(toPlug, fromPlug, false); });
  return VStatus::kSuccess;
}

}  // namespace standin
