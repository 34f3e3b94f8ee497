// VObject: shared, reference-counted handles to host objects.
#include <openvorla/VObject.h>

#include <standin/Objects.h>

#include <utility>

#include "ObjectRecords.h"

OPENVORLA_NAMESPACE_OPEN

VObject VObjectFactory::make(VFn::Type type, const char *name) {
  VObject object;
  object.fRecord = new VObject::Record(type, name);
  if (type == VFn::kAttribute) object.fRecord->attribute.briefName = object.fRecord->name;
  return object;
}

const char *VObjectFactory::name(const VObject &object) {
  return object.fRecord ? object.fRecord->name.c_str() : "";
}

bool VObjectFactory::attributeInfo(const VObject &object, AttributeInfo *info) {
  VObject::Record *record = object.fRecord;
  if (!record || record->type != VFn::kAttribute) return false;
  std::lock_guard<std::mutex> guard(record->mutex);
  *info = record->attribute;
  return true;
}

bool VObjectFactory::updateAttribute(const VObject &object,
                                     const std::function<void(AttributeInfo &)> &change) {
  VObject::Record *record = object.fRecord;
  if (!record || record->type != VFn::kAttribute) return false;
  std::lock_guard<std::mutex> guard(record->mutex);
  change(record->attribute);
  return true;
}

VObject VObjectFactory::makeData(int dataType, std::vector<double> numbers) {
  VObject object = make(VFn::kData, "");
  object.fRecord->dataType = dataType;
  object.fRecord->data = std::move(numbers);
  return object;
}

bool VObjectFactory::readData(const VObject &object, int dataType, int *kind,
                              std::vector<double> *numbers) {
  VObject::Record *record = object.fRecord;
  if (!record || record->type != VFn::kData) return false;
  std::lock_guard<std::mutex> guard(record->mutex);
  if (dataType && record->dataType != dataType) return false;
  if (kind) *kind = record->dataType;
  if (numbers) *numbers = record->data;
  return true;
}

bool VObjectFactory::writeData(const VObject &object, int dataType, std::vector<double> numbers) {
  VObject::Record *record = object.fRecord;
  if (!record || record->type != VFn::kData) return false;
  std::lock_guard<std::mutex> guard(record->mutex);
  if (record->dataType != dataType) return false;
  record->data = std::move(numbers);
  return true;
}

VObject::VObject() : fRecord(nullptr) {}

VObject::VObject(const VObject &other) : fRecord(other.fRecord) {
  if (fRecord) fRecord->refs.fetch_add(1, std::memory_order_relaxed);
}

VObject::~VObject() {
  if (fRecord && fRecord->refs.fetch_sub(1, std::memory_order_acq_rel) == 1) delete fRecord;
}

VObject &VObject::operator=(const VObject &other) {
  VObject copy(other);
  std::swap(fRecord, copy.fRecord);
  return *this;
}

bool VObject::isNull() const { return fRecord == nullptr; }
VFn::Type VObject::apiType() const { return fRecord ? fRecord->type : VFn::kInvalid; }
bool VObject::operator==(const VObject &other) const { return fRecord == other.fRecord; }
bool VObject::operator!=(const VObject &other) const { return fRecord != other.fRecord; }

OPENVORLA_NAMESPACE_CLOSE

namespace standin {

OPENVORLA_NAMESPACE::VObject makeObject(OPENVORLA_NAMESPACE::VFn::Type type, const char *name) {
  return OPENVORLA_NAMESPACE::VObjectFactory::make(type, name);
}

const char *objectName(const OPENVORLA_NAMESPACE::VObject &object) {
  return OPENVORLA_NAMESPACE::VObjectFactory::name(object);
}

}  // namespace standin
