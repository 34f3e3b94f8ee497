// Self-test of the application's engines with a C++ plug-in: the attribute
// function sets, the dependency graph (dirty marks, computing on demand,
// evaluation on several threads), commands with undo and redo, scene files
// and data round trips.
#include <openvorla/VArgList.h>
#include <openvorla/VFileObject.h>
#include <openvorla/VFnNumericAttribute.h>
#include <openvorla/VFnPlugin.h>
#include <openvorla/VFnTypedAttribute.h>
#include <openvorla/VPxCommand.h>
#include <openvorla/VPxData.h>
#include <openvorla/VPxFileTranslator.h>
#include <openvorla/VPxNode.h>
#include <openvorla/VStreamUtils.h>

#include <standin/Graph.h>
#include <standin/Lifetime.h>
#include <standin/Nodes.h>
#include <standin/Objects.h>
#include <standin/Plugins.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <mutex>
#include <sstream>
#include <string>
#include <vector>

#include <unistd.h>

#include "selftest.h"

using namespace OPENVORLA_NAMESPACE;
using standin::Commands;
using standin::Graph;
using standin::Value;

namespace {

std::string text(const VStatus &status) { return status.errorString().asUTF8(); }

Value number(double n) {
  Value v;
  v.number = n;
  return v;
}

Value string(const char *s) {
  Value v;
  v.isString = true;
  v.text = s;
  return v;
}

double get(const std::string &plug) {
  Value v;
  VStatus status = Graph::instance().getAttr(plug, &v);
  return status ? v.number : -1e300;
}

long computeCount(const std::string &node) {
  for (const standin::NodeInfo &n : Graph::instance().nodes())
    if (n.name == node) return n.computeCount;
  return -1;
}

// adder: sum = a + bias, echo = "<" + label + ">". A negative a fails.
struct AdderAttributes {
  VObject a, bias, sum, label, echo;
} gAdder;
int gAdderInitializations = 0;
std::mutex gOrderMutex;
std::vector<std::string> gOrder;  // the nodes in the order they computed

class Adder : public VPxNode {
 public:
  VStatus compute(const VPlug &plug, VDataBlock &block) override {
    {
      std::lock_guard<std::mutex> guard(gOrderMutex);
      gOrder.push_back(name().asUTF8());
    }
    if (plug.attribute() == gAdder.sum) {
      double a = block.inputValue(gAdder.a).asDouble();
      double bias = block.inputValue(gAdder.bias).asDouble();
      if (a < 0) return VStatus(VStatus::kFailure, "negative input");
      VDataHandle out = block.outputValue(gAdder.sum);
      out.setDouble(a + bias);
      out.setClean();
      return VStatus::kSuccess;
    }
    if (plug.attribute() == gAdder.echo) {
      VString label = block.inputValue(gAdder.label).asString();
      block.outputValue(gAdder.echo).set(VString("<") + label + ">");
      return VStatus::kSuccess;
    }
    return VStatus::kUnknownParameter;
  }
};

void *makeAdder() { return new Adder; }

VStatus initAdder() {
  ++gAdderInitializations;
  VFnNumericAttribute numeric;
  VFnTypedAttribute typed;
  gAdder.a = numeric.create("a", "", VFnNumericData::kDouble);
  gAdder.bias = numeric.create("bias", "b", VFnNumericData::kInt, 1);
  numeric.setMin(-5);
  numeric.setMax(5);
  gAdder.sum = numeric.create("sum", "s", VFnNumericData::kDouble);
  numeric.setWritable(false);
  gAdder.label = typed.create("label", "lb", VFnData::kString);
  typed.setDefault("x");
  gAdder.echo = typed.create("echo", "e", VFnData::kString);
  typed.setWritable(false);
  for (const VObject &a : {gAdder.a, gAdder.bias, gAdder.sum, gAdder.label, gAdder.echo})
    VPxNode::addAttribute(a);
  VPxNode::attributeAffects(gAdder.a, gAdder.sum);
  VPxNode::attributeAffects(gAdder.bias, gAdder.sum);
  return VPxNode::attributeAffects(gAdder.label, gAdder.echo);
}

VStatus initBroken() { return VStatus(VStatus::kFailure, "no attributes today"); }

// scaled: an adder with one attribute more, which dirties the sum too.
VStatus initScaled() {
  VPxNode::inheritAttributesFrom("adder");
  VObject scale = VFnNumericAttribute().create("scale", "sc", VFnNumericData::kDouble, 1);
  VPxNode::addAttribute(scale);
  return VPxNode::attributeAffects(scale, gAdder.sum);
}

}  // namespace

void testAttributeSets() {
  VStatus status;
  VFnNumericAttribute numeric;
  CHECK(numeric.setMin(1) == VStatus::kInvalidParameter && numeric.name() == "");
  VObject weight = numeric.create("weight", "w", VFnNumericData::kBoolean, 0.7, &status);
  CHECK(status && numeric.object() == weight && numeric.name() == "weight" &&
        numeric.shortName() == "w");
  CHECK(numeric.defaultValue() == 1.0 && numeric.unitType() == VFnNumericData::kBoolean);
  CHECK(numeric.isReadable() && numeric.isWritable() && numeric.isStorable() &&
        !numeric.isKeyable() && !numeric.hasMin());
  CHECK(numeric.setKeyable(true) && VFnAttribute(weight).isKeyable());
  CHECK(numeric.create("1st", "f", VFnNumericData::kDouble, 0, &status).isNull() &&
        status == VStatus::kInvalidParameter && numeric.object() == weight);
  CHECK(numeric.create("x", "x", VFnNumericData::kLast, 0, &status).isNull() && status.error());

  VFnTypedAttribute typed;
  VObject path = typed.create("path", "p", VFnData::kString, &status);
  CHECK(status && typed.attrType() == VFnData::kString && typed.setDefault("/tmp") &&
        typed.defaultString() == "/tmp");
  CHECK(typed.create("mesh", "m", VFnData::kMesh, &status).isNull() &&
        text(status) ==
            "Typed attributes hold strings, matrices and arrays of numbers, integers, points or "
            "vectors");
  VFnNumericAttribute notNumeric(path, &status);
  CHECK(status == VStatus::kInvalidParameter && notNumeric.object().isNull());
  VFnTypedAttribute notTyped(weight, &status);
  CHECK(status == VStatus::kInvalidParameter);

  // Declarations belong to a node type's initializer.
  status = VPxNode::addAttribute(weight);
  CHECK(status == VStatus::kFailure &&
        text(status) ==
            "No node type is being initialized: attributes are declared in the "
            "initializer of a node type");
  standin::beginNodeType();
  CHECK(VPxNode::addAttribute(weight));
  status = VPxNode::addAttribute(VFnNumericAttribute().create("w", "weight", VFnNumericData::kInt));
  CHECK(text(status) == "The attribute 'w' has a name of the attribute 'weight' added before");
  status = VPxNode::attributeAffects(path, weight);
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) == "The attribute 'path' has not been added to the node type");
  standin::endNodeType();
  CHECK(VPxNode::attributeAffects(weight, weight) == VStatus::kFailure);

  std::ostringstream out;
  CHECK(VStreamUtils::writeDouble(out, 0.1) && VStreamUtils::writeCharBuffer(out, " ") &&
        VStreamUtils::writeInt(out, -3) && out.str() == "0.1 -3");
  out.setstate(std::ios::badbit);
  CHECK(VStreamUtils::writeInt(out, 1) == VStatus::kFailure);

  setenv("GRAPH_TEST_DIR", "/scenes", 1);
  VFileObject file;
  file.setRawFullName("$GRAPH_TEST_DIR/${GRAPH_TEST_NONE}shot.va");
  CHECK(file.expandedFullName() == "/scenes/shot.va");
}

namespace {

VObject gPlugin;

void testNodes() {
  Graph &g = Graph::instance();
  std::string made;
  VStatus status = g.createNode("nothing", "", &made);
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) == "No node type named 'nothing' is registered");
  status = g.createNode("broken", "", &made);
  CHECK(text(status) == "The initializer of the node type 'broken' failed: no attributes today");

  gAdderInitializations = 0;
  CHECK(g.createNode("adder", "", &made) && made == "adder1");
  CHECK(g.createNode("adder", "", &made) && made == "adder2" && gAdderInitializations == 1);
  CHECK(g.createNode("adder", "first", &made) && made == "first");
  status = g.createNode("adder", "first", &made);
  CHECK(status == VStatus::kFailure && text(status) == "A node named 'first' already exists");
  status = g.createNode("adder", "a.b", &made);
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) ==
            "'a.b' is not a node name: letters, digits and '_', not starting with a digit");
  auto nodes = g.nodes();
  CHECK(nodes.size() == 3 && nodes[2].name == "first" && nodes[0].type == "adder" &&
        nodes[0].attributes == std::vector<std::string>({"a", "bias", "sum", "label", "echo"}));

  // A type that inherits has its parent's attributes first.
  CHECK(g.createNode("scaled", "", &made) && made == "scaled1" && get("scaled1.sum") == 1.0);
  CHECK(g.nodes().back().attributes ==
        std::vector<std::string>({"a", "bias", "sum", "label", "echo", "scale"}));
  CHECK(g.setAttr("scaled1.sc", number(3)) && get("scaled1.sum") == 1.0 &&
        computeCount("scaled1") == 2);
  CHECK(g.deleteNode("scaled1"));

  // Values: defaults, kept within the attribute's type and range.
  Value v;
  CHECK(g.getAttr("adder1.sum", &v) && v.number == 1.0 && computeCount("adder1") == 1);
  CHECK(g.getAttr("adder1.s", &v) && computeCount("adder1") == 1);  // clean now
  CHECK(g.setAttr("adder1.bias", number(2.9)) && get("adder1.b") == 2.0);
  CHECK(g.setAttr("adder1.b", number(-40)) && get("adder1.bias") == -5.0);
  CHECK(g.setAttr("adder1.a", number(10)) && get("adder1.sum") == 5.0 &&
        computeCount("adder1") == 2);
  CHECK(g.getAttr("adder1.echo", &v) && v.isString && v.text == "<x>");
  CHECK(g.setAttr("adder1.label", string("y")) && g.getAttr("adder1.e", &v) && v.text == "<y>");
  CHECK(computeCount("adder1") == 4 && get("adder1.sum") == 5.0);  // the label left sum clean

  status = g.setAttr("adder1.sum", number(1));
  CHECK(status == VStatus::kFailure && text(status) == "The plug 'adder1.sum' is not writable");
  status = g.setAttr("adder1.label", number(1));
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) == "The plug 'adder1.label' holds a string, not a number");
  status = g.getAttr("nobody.a", &v);
  CHECK(status == VStatus::kNotFound && text(status) == "No node is named 'nobody'");
  status = g.getAttr("adder1.weight", &v);
  CHECK(text(status) == "The node 'adder1' has no attribute 'weight'");
  status = g.setAttr("adder1", number(1));
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) == "'adder1' is not a plug: a plug is named node.attribute");

  // A failed compute leaves the value dirty: the next read computes again.
  CHECK(g.setAttr("adder2.a", number(-1)));
  status = g.getAttr("adder2.sum", &v);
  CHECK(status == VStatus::kFailure &&
        text(status) == "Computing 'adder2.sum' failed: negative input");
  CHECK(!g.getAttr("adder2.sum", &v) && computeCount("adder2") == 2);
}

void testConnections() {
  Graph &g = Graph::instance();
  // adder1.sum -> adder2.a -> adder2.sum -> first.a
  CHECK(g.setAttr("adder1.a", number(1)) && g.setAttr("adder1.b", number(1)));
  CHECK(g.connect("adder1.sum", "adder2.a") && g.connect("adder2.s", "first.a"));
  long before1 = computeCount("adder1"), before2 = computeCount("adder2");
  CHECK(get("first.sum") == 4.0 && computeCount("adder1") == before1 + 1 &&
        computeCount("adder2") == before2 + 1);
  CHECK(get("adder2.a") == 2.0);
  CHECK(g.setAttr("adder1.a", number(5)) && get("first.sum") == 8.0);
  CHECK(get("first.sum") == 8.0 && computeCount("adder1") == before1 + 2);

  VStatus status = g.setAttr("adder2.a", number(0));
  CHECK(status == VStatus::kFailure &&
        text(status) == "The plug 'adder2.a' takes its value from 'adder1.sum'");
  status = g.connect("first.sum", "adder1.a");
  CHECK(text(status) == "Connecting 'first.sum' to 'adder1.a' would make a cycle");
  status = g.connect("adder1.sum", "adder1.b");
  CHECK(text(status) == "Connecting 'adder1.sum' to 'adder1.bias' would make a cycle");
  status = g.connect("adder1.sum", "adder2.a");
  CHECK(text(status) == "'adder1.sum' is already connected to 'adder2.a'");
  status = g.connect("first.sum", "adder2.a");
  CHECK(text(status) == "The plug 'adder2.a' already takes its value from 'adder1.sum'");
  status = g.connect("adder1.sum", "first.label");
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) ==
            "Cannot connect 'adder1.sum', which holds a number, to 'first.label', "
            "which holds a string");
  status = g.connect("adder1.a", "first.echo");
  CHECK(text(status) == "The plug 'first.echo' is not writable: it is no destination");

  // An upstream failure is the downstream read's too.
  CHECK(g.setAttr("adder1.a", number(-3)));
  Value v;
  status = g.getAttr("first.sum", &v);
  CHECK(text(status) == "Computing 'adder1.sum' failed: negative input");

  // The destination keeps the value it last took.
  CHECK(g.setAttr("adder1.a", number(2)) && get("first.sum") == 5.0);
  CHECK(g.disconnect("adder2.sum", "first.a") && get("first.a") == 4.0);
  status = g.disconnect("adder2.sum", "first.a");
  CHECK(text(status) == "'adder2.sum' is not connected to 'first.a'");
  CHECK(g.setAttr("first.a", number(0)) && get("first.sum") == 1.0);

  // Deleting a node deletes the plug-in's node and its connections.
  long alive = standin::aliveCount("VPxNode");
  CHECK(g.deleteNode("adder1") && standin::aliveCount("VPxNode") == alive - 1);
  CHECK(g.setAttr("adder2.a", number(7)) && get("adder2.sum") == 8.0);
  CHECK(text(g.deleteNode("adder1")) == "No node is named 'adder1'");
}

// Layers of 8 nodes; a node of layer l takes a from the node above it and
// bias from the one above and right of it.
constexpr int kWidth = 8, kLayers = 4;

std::string nodeName(int layer, int i) {
  return "n" + std::to_string(layer) + "_" + std::to_string(i);
}

std::vector<double> expectedSums(const std::vector<double> &inputs) {
  std::vector<double> sums(kWidth * kLayers), layer(kWidth);
  for (int i = 0; i < kWidth; ++i) layer[i] = sums[i] = inputs[i] + 1;
  for (int l = 1; l < kLayers; ++l) {
    std::vector<double> next(kWidth);
    for (int i = 0; i < kWidth; ++i) next[i] = layer[i] + layer[(i + 1) % kWidth];
    layer = next;
    std::copy(layer.begin(), layer.end(), sums.begin() + l * kWidth);
  }
  return sums;
}

bool sumsAre(const std::vector<double> &sums) {
  bool same = true;
  for (int l = 0; l < kLayers; ++l)
    for (int i = 0; i < kWidth; ++i) {
      Value v;
      same = same && Graph::instance().getAttr(nodeName(l, i) + ".sum", &v) &&
             v.number == sums[l * kWidth + i];
    }
  return same;
}

// Every node computed after the nodes it reads.
bool inTopologicalOrder() {
  auto at = [](const std::string &name) {
    return std::find(gOrder.begin(), gOrder.end(), name) - gOrder.begin();
  };
  bool ordered = true;
  for (int l = 1; l < kLayers; ++l)
    for (int i = 0; i < kWidth; ++i) {
      auto self = at(nodeName(l, i));
      ordered = ordered && self < static_cast<long>(gOrder.size()) &&
                at(nodeName(l - 1, i)) < self && at(nodeName(l - 1, (i + 1) % kWidth)) < self;
    }
  return ordered;
}

void testEvaluation() {
  Graph &g = Graph::instance();
  g.clear();
  std::vector<double> inputs(kWidth);
  for (int l = 0; l < kLayers; ++l)
    for (int i = 0; i < kWidth; ++i) {
      std::string made;
      g.createNode("adder", nodeName(l, i), &made);
      if (l == 0) {
        inputs[i] = i;
        g.setAttr(made + ".a", number(i));
        continue;
      }
      g.connect(nodeName(l - 1, i) + ".sum", made + ".a");
      g.connect(nodeName(l - 1, (i + 1) % kWidth) + ".sum", made + ".b");
    }

  gOrder.clear();
  CHECK(g.evaluate(1) && g.lastEvaluationThreads() == std::vector<int>({0}));
  // Each node computed its two dirty outputs once, its sources first; reading
  // the values computes nothing more.
  CHECK(gOrder.size() == 2 * kWidth * kLayers && inTopologicalOrder());
  CHECK(sumsAre(expectedSums(inputs)) && gOrder.size() == 2 * kWidth * kLayers);

  for (int threads : {4, 16}) {
    for (int i = 0; i < kWidth; ++i) g.setAttr(nodeName(0, i) + ".a", number(inputs[i] += 10));
    gOrder.clear();
    CHECK(g.evaluate(threads) && inTopologicalOrder());
    // The threads take the nodes in turn: as many as the widest level has
    // nodes (8) work at most, and those that found one computed.
    size_t used = g.lastEvaluationThreads().size();
    CHECK(used >= 1 && used <= static_cast<size_t>(std::min(threads, 8)));
    CHECK(gOrder.size() == kWidth * kLayers && sumsAre(expectedSums(inputs)));
  }
  CHECK(g.evaluate(4) && g.lastEvaluationThreads().empty());  // nothing dirty
  CHECK(g.evaluate(0) == VStatus::kInvalidParameter);

  // A failure stops what is downstream of it and nothing else; what it
  // stopped stays dirty for the next evaluation.
  CHECK(g.setAttr("n0_3.a", number(-1)) && g.setAttr("n0_6.a", number(-1)));
  CHECK(g.setAttr("n0_0.a", number(inputs[0] = 100)));
  gOrder.clear();
  VStatus status = g.evaluate(4);
  CHECK(status == VStatus::kFailure &&
        text(status) == "Computing 'n0_3.sum' failed: negative input (and 1 more failed)");
  CHECK(std::count(gOrder.begin(), gOrder.end(), "n1_2") == 0 &&
        std::count(gOrder.begin(), gOrder.end(), "n2_2") == 0 &&
        std::count(gOrder.begin(), gOrder.end(), "n1_7") == 1);
  CHECK(g.setAttr("n0_3.a", number(inputs[3])) && g.setAttr("n0_6.a", number(inputs[6])));
  CHECK(g.evaluate(3) && sumsAre(expectedSums(inputs)));
}

}  // namespace

void testGraph() {
  standin::unloadAllPlugins();
  gPlugin = standin::loadPlugin("graphTest", "/plug-ins/graph");
  VFnPlugin plugin(gPlugin);
  CHECK(plugin.registerNode("adder", VTypeId(0x7000), makeAdder, initAdder));
  CHECK(plugin.registerNode("broken", VTypeId(0x7001), makeAdder, initBroken));
  CHECK(plugin.registerNode("scaled", VTypeId(0x7002), makeAdder, initScaled));
  standin::resetCounts();
  testNodes();
  testConnections();
  testEvaluation();

  long alive = standin::aliveCount("VPxNode");
  CHECK(alive == static_cast<long>(Graph::instance().nodes().size()));
  Graph::instance().deleteNodesOfPlugin("graphTest");
  CHECK(Graph::instance().nodes().empty() && standin::aliveCount("VPxNode") == 0);
  // The plug-in's types are initialized anew when it comes back.
  gAdderInitializations = 0;
  std::string made;
  CHECK(Graph::instance().createNode("adder", "", &made) && gAdderInitializations == 1);
  Graph::instance().clear();
  CHECK(standin::aliveCount("VPxNode") == 0);
  standin::unloadAllPlugins();
}

namespace {

// accumulate <n>: adds n to the total, undoably; the result is the total.
int gTotal = 0;

class Accumulate : public VPxCommand {
 public:
  Accumulate() { setUndoable(true); }
  VStatus doIt(const VArgList &args) override {
    VStatus status;
    fAmount = args.asInt(0, &status);
    if (!status) return VStatus(VStatus::kInvalidParameter, "accumulate needs a whole number");
    return redoIt();
  }
  VStatus redoIt() override {
    setResult(gTotal += fAmount);
    return VStatus::kSuccess;
  }
  VStatus undoIt() override {
    gTotal -= fAmount;
    return VStatus::kSuccess;
  }

 private:
  int fAmount = 0;
};

// describe <args...>: not undoable; its result is its command line.
class Describe : public VPxCommand {
 public:
  VStatus doIt(const VArgList &) override {
    setResult(commandString());
    return VStatus::kSuccess;
  }
};

void *makeAccumulate() { return new Accumulate; }
void *makeDescribe() { return new Describe; }
void *makeNothing() { return nullptr; }

void testCommands() {
  Commands &c = Commands::instance();
  c.flush();
  long alive = standin::aliveCount("VPxCommand");
  standin::CommandResult result;
  CHECK(c.run("describe", {string("a b"), number(2), number(0.5)}, &result) &&
        result.text() == "describe \"a b\" 2 0.5" && standin::aliveCount("VPxCommand") == alive);
  CHECK(c.run("accumulate", {number(5)}, &result) && result.text() == "5");
  CHECK(c.run("accumulate", {number(3)}, &result) && result.text() == "8");
  CHECK(standin::aliveCount("VPxCommand") == alive + 2);
  CHECK(c.undo() && gTotal == 5 && c.undo() && gTotal == 0);
  VStatus status = c.undo();
  CHECK(status == VStatus::kFailure && text(status) == "There is nothing to undo");
  CHECK(c.redo() && gTotal == 5 && standin::aliveCount("VPxCommand") == alive + 2);
  // A new command ends the redo history.
  CHECK(c.run("accumulate", {number(1)}, &result) && gTotal == 6);
  CHECK(standin::aliveCount("VPxCommand") == alive + 2);
  CHECK(text(c.redo()) == "There is nothing to redo");

  status = c.run("accumulate", {string("lots")}, &result);
  CHECK(status == VStatus::kInvalidParameter &&
        text(status) == "The command 'accumulate' failed: accumulate needs a whole number");
  CHECK(standin::aliveCount("VPxCommand") == alive + 2);
  status = c.run("vanish", {}, &result);
  CHECK(status == VStatus::kNotFound && text(status) == "No command named 'vanish' is registered");
  status = c.run("nothing", {}, &result);
  CHECK(text(status) == "The creator of the command 'nothing' made no command");
  c.flush();
  CHECK(standin::aliveCount("VPxCommand") == alive && c.undo().error());

  VPxCommand::setResult(2.5);
  VPxCommand::appendToResult(-1.0);
  CHECK(standin::currentCommandResult().text() == "2.5 -1");
  VPxCommand::clearResult();
  CHECK(standin::currentCommandResult().text() == "");
}

// Writes "scene" to its file and reads it back; "writeOnly" fails to write.
VPxFileTranslator::FileAccessMode gSeenMode;

class TextTranslator : public VPxFileTranslator {
 public:
  bool haveWriteMethod() const override { return true; }
  bool haveReadMethod() const override { return !fWriteOnly; }
  VStatus writer(const VFileObject &file, const VString &, FileAccessMode mode) override {
    gSeenMode = fileAccessMode();
    if (fWriteOnly) return VStatus(VStatus::kFailure, "disk full");
    std::ofstream(file.expandedFullName().asUTF8()) << "scene " << mode;
    return VStatus::kSuccess;
  }
  VStatus reader(const VFileObject &file, const VString &, FileAccessMode) override {
    gSeenMode = fileAccessMode();
    std::string word;
    std::ifstream(file.expandedFullName().asUTF8()) >> word;
    return word == "scene" ? VStatus(VStatus::kSuccess) : VStatus(VStatus::kFailure, "not a scene");
  }
  bool fWriteOnly = false;
};

void *makeText() { return new TextTranslator; }
void *makeWriteOnly() {
  auto *t = new TextTranslator;
  t->fWriteOnly = true;
  return t;
}

void testFiles() {
  using standin::Files;
  std::string path = "/tmp/graph_selftest_" + std::to_string(getpid()) + ".txt";
  long alive = standin::aliveCount("VPxFileTranslator");
  CHECK(Files::exportScene(path, "text") && gSeenMode == VPxFileTranslator::kExportAccessMode);
  CHECK(Files::importScene(path, "text") && gSeenMode == VPxFileTranslator::kImportAccessMode);
  CHECK(VPxFileTranslator::fileAccessMode() == VPxFileTranslator::kUnknownAccessMode);
  std::ofstream(path) << "other";
  CHECK(text(Files::importScene(path, "text")) ==
        "Reading '" + path + "' with the file translator 'text' failed: not a scene");
  std::remove(path.c_str());
  CHECK(text(Files::exportScene(path, "writeOnly")) ==
        "Writing '" + path + "' with the file translator 'writeOnly' failed: disk full");
  CHECK(text(Files::importScene(path, "writeOnly")) ==
        "The file translator 'writeOnly' does not read files");
  CHECK(text(Files::exportScene(path, "none")) == "No file translator named 'none' is registered");
  CHECK(standin::aliveCount("VPxFileTranslator") == alive);
}

// pair: two numbers, written as "a b".
class Pair : public VPxData {
 public:
  void copy(const VPxData &src) override { fValues = static_cast<const Pair &>(src).fValues; }
  VTypeId typeId() const override { return VTypeId(0x7100); }
  VString name() const override { return "pair"; }
  VStatus readASCII(const VArgList &args, unsigned int &last) override {
    VStatus status;
    for (unsigned int i = 0; i < 2 && status; ++i) fValues[i] = args.asDouble(last + i, &status);
    if (!status) return VStatus(VStatus::kFailure, "a pair is two numbers");
    last += 1;
    return VStatus::kSuccess;
  }
  VStatus writeASCII(std::ostream &out) override {
    VStreamUtils::writeDouble(out, fValues[0]);
    VStreamUtils::writeCharBuffer(out, " ");
    return VStreamUtils::writeDouble(out, fValues[1]);
  }

 private:
  std::vector<double> fValues{0, 0};
};

void *makePair() { return new Pair; }

void testDataRoundTrip() {
  std::string written, copied;
  long alive = standin::aliveCount("VPxData");
  CHECK(standin::roundTripData("pair", "  1.5\n\"-2\" ", &written, &copied) &&
        written == "1.5 -2" && copied == written);
  VStatus status = standin::roundTripData("pair", "1 two", &written, &copied);
  CHECK(text(status) == "Reading the data type 'pair' from ASCII failed: a pair is two numbers");
  status = standin::roundTripData("triple", "1", &written, &copied);
  CHECK(status == VStatus::kNotFound &&
        text(status) == "No data type named 'triple' is registered");
  CHECK(standin::aliveCount("VPxData") == alive);
}

}  // namespace

void testEngines() {
  standin::unloadAllPlugins();
  VObject object = standin::loadPlugin("engineTest", "/plug-ins/engines");
  VFnPlugin plugin(object);
  CHECK(plugin.registerCommand("accumulate", makeAccumulate) &&
        plugin.registerCommand("describe", makeDescribe) &&
        plugin.registerCommand("nothing", makeNothing));
  CHECK(plugin.registerFileTranslator("text", nullptr, makeText) &&
        plugin.registerFileTranslator("writeOnly", nullptr, makeWriteOnly));
  CHECK(plugin.registerData("pair", VTypeId(0x7100), makePair));
  testCommands();
  testFiles();
  testDataRoundTrip();
  standin::unloadAllPlugins();
}
