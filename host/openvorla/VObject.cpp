// VObject: shared, reference-counted handles to host objects.
#include <openvorla/VObject.h>

#include <standin/Objects.h>

#include <atomic>
#include <string>
#include <utility>

OPENVORLA_NAMESPACE_OPEN

struct VObject::Record {
  std::atomic<int> refs{1};
  VFn::Type type;
  std::string name;
};

// The one place that makes records; reached through the stand-in's factory.
class VObjectFactory {
public:
  static VObject make(VFn::Type type, const char *name) {
    VObject object;
    object.fRecord = new VObject::Record{{1}, type, name ? name : ""};
    return object;
  }

  static const char *name(const VObject &object) {
    return object.fRecord ? object.fRecord->name.c_str() : "";
  }
};

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
