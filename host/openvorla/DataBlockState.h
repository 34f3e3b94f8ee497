// The values behind data blocks and handles, for the library's own use.
//
// A block made by the graph for one of its nodes is bound to that node: before
// a compute reads a value through inputValue, the block asks the node to bring
// it up to date (pulling a connected input from its source, computing the
// source first when it is dirty), and an attribute the node does not have is
// refused. The binding is weak, so a block kept past its node's deletion is a
// plain block again.
#pragma once

#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>
#include <openvorla/VObject.h>
#include <openvorla/VStatus.h>
#include <openvorla/VString.h>

#include <memory>
#include <mutex>
#include <string>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

// One value: a number, a string, or numbers of a kind, which is a VFnData::Type:
// kNumeric for a compound of two to four (a point, a vector, a color),
// kMatrix for sixteen (row by row), an array kind for its elements (points
// and vectors three numbers each).
struct VDataSlot {
  std::mutex mutex;
  double number = 0.0;
  VString text;
  bool isText = false;
  int dataType = 0;  // 0: a number or a string
  std::vector<double> numbers;
  bool clean = false;

  void setNumber(double value, bool makeClean) {
    std::lock_guard<std::mutex> guard(mutex);
    number = value;
    text = VString();
    isText = false;
    dataType = 0;
    numbers.clear();
    if (makeClean) clean = true;
  }
  void setText(const std::string &value, bool makeClean) {
    std::lock_guard<std::mutex> guard(mutex);
    number = 0.0;
    text = value.c_str();
    isText = true;
    dataType = 0;
    numbers.clear();
    if (makeClean) clean = true;
  }
  void setNumbers(int type, std::vector<double> values, bool makeClean) {
    std::lock_guard<std::mutex> guard(mutex);
    number = 0.0;
    text = VString();
    isText = false;
    dataType = type;
    numbers = std::move(values);
    if (makeClean) clean = true;
  }
  void setClean(bool state) {
    std::lock_guard<std::mutex> guard(mutex);
    clean = state;
  }
  bool isClean() {
    std::lock_guard<std::mutex> guard(mutex);
    return clean;
  }
  // Takes the other's value (not its cleanliness) and becomes clean.
  void copyFrom(VDataSlot &other) {
    double n;
    VString t;
    bool isT;
    int type;
    std::vector<double> values;
    {
      std::lock_guard<std::mutex> guard(other.mutex);
      n = other.number;
      t = other.text;
      isT = other.isText;
      type = other.dataType;
      values = other.numbers;
    }
    std::lock_guard<std::mutex> guard(mutex);
    number = n;
    text = t;
    isText = isT;
    dataType = type;
    numbers = std::move(values);
    clean = true;
  }
};

// The node a bound block belongs to.
class DataBlockOwner {
 public:
  virtual ~DataBlockOwner() = default;
  // Brings the attribute's value up to date for a read. kInvalidParameter for
  // an attribute the node lacks; another failure when an upstream compute
  // failed, the value then being the last one.
  virtual VStatus prepareRead(const VObject &attribute) = 0;
  // kInvalidParameter for an attribute the node lacks.
  virtual VStatus checkAttribute(const VObject &attribute) = 0;
};

// Values are few per node, so they are found by a linear search on the
// attribute and the element index (-1 for the attribute itself).
struct VDataBlock::State {
  struct Entry {
    VObject attribute;
    int index;
    std::shared_ptr<VDataSlot> slot;
  };

  explicit State(const VDGContext &c) : context(c) {}

  std::shared_ptr<VDataSlot> find(const VObject &attribute, int index, bool make) {
    std::lock_guard<std::mutex> guard(mutex);
    for (const Entry &e : entries)
      if (e.index == index && e.attribute == attribute) return e.slot;
    if (!make) return nullptr;
    entries.push_back({attribute, index, std::make_shared<VDataSlot>()});
    return entries.back().slot;
  }

  std::mutex mutex;
  std::vector<Entry> entries;
  VDGContext context;
  std::weak_ptr<DataBlockOwner> owner;  // set once, before the block is shared
};

class VDataBlockAccess {
 public:
  static VDataBlock bound(const std::weak_ptr<DataBlockOwner> &owner) {
    VDataBlock block;
    block.fState->owner = owner;
    return block;
  }
  static std::shared_ptr<VDataSlot> slot(const VDataBlock &block, const VObject &attribute) {
    return block.fState->find(attribute, -1, true);
  }
};

OPENVORLA_NAMESPACE_CLOSE
