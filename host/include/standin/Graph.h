// Stand-in only: the application's dependency graph and command engine, as
// the application and its host scripting module drive them. Plug-ins never
// see this: they reach the graph through the SDK (VPxNode::addAttribute,
// attributeAffects, compute with VPlug and VDataBlock, VFnNumericAttribute).
#pragma once

#include <openvorla/VApiVersion.h>
#include <openvorla/VStatus.h>

#include <string>
#include <vector>

namespace standin {

// One value of an attribute: numeric attributes hold a double (booleans and
// integers as doubles too), string attributes a string, the others numbers
// in a row: a compound (a point, a vector, a color), a matrix (row by row),
// an array (of points and vectors three numbers each).
struct Value {
  bool isString = false;
  double number = 0.0;
  std::string text;
  // A list: `numbers` in a row, taken from a list of `width` numbers each
  // (a list of lists), or of single numbers (width 0).
  bool isList = false;
  size_t width = 0;
  std::vector<double> numbers;
  // What a value read from a plug holds: 0 for a number or a string, else
  // the VFnData::Type (kNumeric for a compound).
  int dataType = 0;
};

// A node as the application lists it.
struct NodeInfo {
  std::string name;
  std::string type;
  std::vector<std::string> attributes;  // long names, in declaration order
  long computeCount = 0;                // compute calls made on the node so far
};

class OPENVORLA_EXPORT Graph {
 public:
  static Graph &instance();

  // A node of a registered type, made through the type's creator (the type's
  // initializer runs once, before its first node). `name` empty: "<type>1",
  // "<type>2", ... The graph owns the node.
  OPENVORLA_NAMESPACE::VStatus createNode(const std::string &type, const std::string &name,
                                          std::string *made);
  OPENVORLA_NAMESPACE::VStatus deleteNode(const std::string &name);
  // Deletes every node whose type a plug-in registered (before it unloads).
  void deleteNodesOfPlugin(const std::string &plugin);
  std::vector<NodeInfo> nodes() const;

  // "node.attribute" plugs. Setting an input marks what it affects dirty,
  // downstream through connections too. Getting an output computes it when
  // dirty (the node's compute, through the director for a Python node).
  OPENVORLA_NAMESPACE::VStatus setAttr(const std::string &plug, const Value &value);
  OPENVORLA_NAMESPACE::VStatus getAttr(const std::string &plug, Value *value);
  OPENVORLA_NAMESPACE::VStatus connect(const std::string &source, const std::string &destination);
  OPENVORLA_NAMESPACE::VStatus disconnect(const std::string &source,
                                          const std::string &destination);

  // Computes every dirty output of the graph. Nodes whose inputs are clean
  // are computed together on a pool of `threads` host threads (1: all on the
  // calling thread); each call into Python takes the interpreter lock itself.
  // The caller must not hold the interpreter lock when threads > 1.
  OPENVORLA_NAMESPACE::VStatus evaluate(int threads);
  // The host threads that ran compute during the last evaluate(), as small
  // numbers 0..n-1 in the order they first computed.
  std::vector<int> lastEvaluationThreads() const;

  void clear();  // deletes every node

 private:
  Graph();
  struct Impl;
  Impl *impl_;
};

// What a command set as its result: one value or an array of them.
struct OPENVORLA_EXPORT CommandResult {
  enum Kind { kNone, kInt, kDouble, kString } kind = kNone;
  bool isArray = false;
  std::vector<double> numbers;     // kInt, kDouble
  std::vector<std::string> texts;  // kString
  // As text: a number as the shortest text that reads back as it, the
  // elements of an array separated by single blanks, "" for no result.
  std::string text() const;
};

// Commands: made through the registry, run, and kept for undo and redo when
// they are undoable.
class OPENVORLA_EXPORT Commands {
 public:
  static Commands &instance();
  // Runs the command with its arguments (numbers and strings), passed in a
  // VArgList. When the command has a syntax (its registration's syntax
  // creator made one and its hasSyntax() is true) the arguments are checked
  // and converted against it first, and a misuse fails before the command's
  // doIt runs.
  OPENVORLA_NAMESPACE::VStatus run(const std::string &name, const std::vector<Value> &args,
                                   CommandResult *result);
  OPENVORLA_NAMESPACE::VStatus undo();
  OPENVORLA_NAMESPACE::VStatus redo();
  // Deletes the commands kept for undo and redo.
  void flush();

 private:
  Commands();
  struct Impl;
  Impl *impl_;
};

// The current command result.
OPENVORLA_EXPORT CommandResult currentCommandResult();

// Scene files through registered file translators: the translator's writer
// and reader run with the file named by `path` and the options: the
// "name=value" pairs, separated by ';', that the translator was registered
// with, each replaced by the one of that name in `options`, and the others
// of `options` after them.
class OPENVORLA_EXPORT Files {
 public:
  static OPENVORLA_NAMESPACE::VStatus exportScene(const std::string &path,
                                                  const std::string &translator,
                                                  const std::string &options = "");
  static OPENVORLA_NAMESPACE::VStatus importScene(const std::string &path,
                                                  const std::string &translator,
                                                  const std::string &options = "");
  // The options as the translator gets them.
  static std::string mergeOptions(const std::string &defaults, const std::string &options);
};

// A registered data type exercised as the application does: made through its
// creator, read from ASCII text (readASCII with the text's words as its
// argument list), copied into a second instance (copy), and both written
// back as ASCII (writeASCII). Both instances are deleted afterwards.
OPENVORLA_EXPORT OPENVORLA_NAMESPACE::VStatus roundTripData(const std::string &dataType,
                                                           const std::string &text,
                                                           std::string *written,
                                                           std::string *copied);

}  // namespace standin
