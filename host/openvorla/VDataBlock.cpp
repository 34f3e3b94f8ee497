// VDataBlock and VDataHandle: the values a node computes from and into.
#include <openvorla/VDataBlock.h>
#include <openvorla/VDataHandle.h>

#include <utility>

#include <openvorla/VFnData.h>

#include "DataBlockState.h"
#include "ObjectRecords.h"

OPENVORLA_NAMESPACE_OPEN

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

VVector VDataHandle::asVector() const {
  if (!fSlot) return VVector();
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  const std::vector<double> &n = fSlot->numbers;
  if (fSlot->dataType != VFnData::kNumeric || n.size() < 2) return VVector();
  return VVector(n[0], n[1], n.size() > 2 ? n[2] : 0.0);
}

VMatrix VDataHandle::asMatrix() const {
  if (!fSlot) return VMatrix();
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  if (fSlot->dataType != VFnData::kMatrix || fSlot->numbers.size() != 16) return VMatrix();
  double rows[4][4];
  for (int i = 0; i < 16; ++i) rows[i / 4][i % 4] = fSlot->numbers[i];
  return VMatrix(rows);
}

VObject VDataHandle::data() const {
  if (!fSlot) return VObject();
  std::lock_guard<std::mutex> guard(fSlot->mutex);
  if (!fSlot->dataType || fSlot->dataType == VFnData::kNumeric) return VObject();
  return VObjectFactory::makeData(fSlot->dataType, fSlot->numbers);
}

void VDataHandle::set2Double(double x, double y) {
  if (fSlot) fSlot->setNumbers(VFnData::kNumeric, {x, y}, false);
}

void VDataHandle::set3Double(double x, double y, double z) {
  if (fSlot) fSlot->setNumbers(VFnData::kNumeric, {x, y, z}, false);
}

void VDataHandle::setMVector(const VVector &value) { set3Double(value.x, value.y, value.z); }

void VDataHandle::setMMatrix(const VMatrix &value) {
  if (!fSlot) return;
  std::vector<double> numbers(16);
  for (int i = 0; i < 16; ++i) numbers[i] = value(i / 4, i % 4);
  fSlot->setNumbers(VFnData::kMatrix, std::move(numbers), false);
}

VStatus VDataHandle::setMObject(const VObject &data) {
  int kind = 0;
  std::vector<double> numbers;
  if (!VObjectFactory::readData(data, 0, &kind, &numbers))
    return VStatus(VStatus::kInvalidParameter, "The object is not a data object");
  if (fSlot) fSlot->setNumbers(kind, std::move(numbers), false);
  return VStatus::kSuccess;
}

void VDataHandle::set(double value) { setDouble(value); }
void VDataHandle::set(const VString &value) { setString(value); }

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

// A bound block asks its node first: for a read, to bring the value up to
// date; for a write, whether the node has the attribute. Elements are the
// block's own.
VDataHandle VDataBlock::inputValue(const VPlug &plug, VStatus *ReturnStatus) {
  return value(plug, true, ReturnStatus);
}

VDataHandle VDataBlock::outputValue(const VObject &attribute, VStatus *ReturnStatus) {
  return outputValue(VPlug(VObject(), attribute), ReturnStatus);
}

VDataHandle VDataBlock::outputValue(const VPlug &plug, VStatus *ReturnStatus) {
  return value(plug, false, ReturnStatus);
}

VDataHandle VDataBlock::value(const VPlug &plug, bool forRead, VStatus *ReturnStatus) const {
  if (plug.isNull()) {
    if (ReturnStatus) *ReturnStatus = nullAttribute();
    return VDataHandle();
  }
  VStatus status;
  std::shared_ptr<DataBlockOwner> owner = fState->owner.lock();
  if (owner && !plug.isElement()) {
    status = forRead ? owner->prepareRead(plug.attribute()) : owner->checkAttribute(plug.attribute());
    if (status == VStatus::kInvalidParameter) {
      if (ReturnStatus) *ReturnStatus = status;
      return VDataHandle();
    }
  }
  if (ReturnStatus) *ReturnStatus = status;
  return VDataHandle(fState->find(plug.attribute(), plug.logicalIndex(), true));
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
