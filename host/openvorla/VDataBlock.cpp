// VDataBlock and VDataHandle: the values a node computes from and into.
#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>

#include <mutex>
#include <utility>
#include <vector>

OPENVORLA_NAMESPACE_OPEN

struct VDataSlot {
  std::mutex mutex;
  double number = 0.0;
  VString text;
  bool isText = false;
  bool clean = false;
};

VDataHandle::VDataHandle() = default;
VDataHandle::VDataHandle(std::shared_ptr<VDataSlot> slot) : fSlot(std::move(slot)) {}
VDataHandle::VDataHandle(const VDataHandle &other) = default;
VDataHandle::~VDataHandle() = default;
VDataHandle &VDataHandle::operator=(const VDataHandle &other) = default;

bool VDataHandle::isNull() const { return !fSlot; }

double VDataHandle::asDouble() const {
  if (!fSlot) return 0.0;
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  return fSlot->isText ? 0.0 : fSlot->number;
}

float VDataHandle::asFloat() const { return static_cast<float>(asDouble()); }
int VDataHandle::asInt() const { return static_cast<int>(asDouble()); }
bool VDataHandle::asBool() const { return asDouble() != 0.0; }

VString VDataHandle::asString() const {
  if (!fSlot) return VString();
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  return fSlot->isText ? fSlot->text : VString();
}

void VDataHandle::setDouble(double value) {
  if (!fSlot) return;
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  fSlot->number = value;
  fSlot->text = VString();
  fSlot->isText = false;
}

void VDataHandle::setFloat(float value) { setDouble(value); }
void VDataHandle::setInt(int value) { setDouble(value); }
void VDataHandle::setBool(bool value) { setDouble(value ? 1.0 : 0.0); }

void VDataHandle::setString(const VString &value) {
  if (!fSlot) return;
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  fSlot->number = 0.0;
  fSlot->text = value;
  fSlot->isText = true;
}

void VDataHandle::setClean() {
  if (!fSlot) return;
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  fSlot->clean = true;
}

bool VDataHandle::isClean() const {
  if (!fSlot) return false;
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  return fSlot->clean;
}

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
};

namespace {

VStatus nullAttribute() {
  return VStatus(VStatus::kInvalidParameter, "The data block has no value for a null attribute");
}

}  // namespace

VDataBlock::VDataBlock() : VDataBlock(VDGContext()) {}
VDataBlock::VDataBlock(const VDGContext &context) : fState(std::make_shared<State>(context)) {}
VDataBlock::VDataBlock(const VDataBlock &other) = default;
VDataBlock::~VDataBlock() = default;
VDataBlock &VDataBlock::operator=(const VDataBlock &other) = default;

VDataHandle VDataBlock::inputValue(const VObject &attribute, VStatus *ReturnStatus) {
  return inputValue(VPlug(VObject(), attribute), ReturnStatus);
}

VDataHandle VDataBlock::inputValue(const VPlug &plug, VStatus *ReturnStatus) {
  if (plug.isNull()) {
    if (ReturnStatus) *ReturnStatus = nullAttribute();
    return VDataHandle();
  }
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return VDataHandle(fState->find(plug.attribute(), plug.logicalIndex(), true));
}

VDataHandle VDataBlock::outputValue(const VObject &attribute, VStatus *ReturnStatus) {
  return inputValue(attribute, ReturnStatus);
}

VDataHandle VDataBlock::outputValue(const VPlug &plug, VStatus *ReturnStatus) {
  return inputValue(plug, ReturnStatus);
}

VStatus VDataBlock::setClean(const VObject &attribute) {
  return setClean(VPlug(VObject(), attribute));
}

VStatus VDataBlock::setClean(const VPlug &plug) {
  VStatus status;
  outputValue(plug, &status).setClean();
  return status;
}

bool VDataBlock::isClean(const VObject &attribute, VStatus *ReturnStatus) const {
  return isClean(VPlug(VObject(), attribute), ReturnStatus);
}

bool VDataBlock::isClean(const VPlug &plug, VStatus *ReturnStatus) const {
  if (plug.isNull()) {
    if (ReturnStatus) *ReturnStatus = nullAttribute();
    return false;
  }
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  auto slot = fState->find(plug.attribute(), plug.logicalIndex(), false);
  return slot && VDataHandle(slot).isClean();
}

VDGContext VDataBlock::context() const { return fState->context; }

OPENVORLA_NAMESPACE_CLOSE
