// VFnAttribute: attribute names and flags, and the making of attribute
// objects that the derived function sets share.
#include <openvorla/VFnAttribute.h>

#include <cctype>
#include <string>

#include "AttributeSets.h"

OPENVORLA_NAMESPACE_OPEN

namespace attributes {

namespace {

bool wellFormed(const std::string &name) {
  if (name.empty() || std::isdigit(static_cast<unsigned char>(name[0]))) return false;
  for (char c : name)
    if (!std::isalnum(static_cast<unsigned char>(c)) && c != '_') return false;
  return true;
}

VStatus notAttached() {
  return VStatus(VStatus::kInvalidParameter, "The function set is not attached to an attribute");
}

}  // namespace

VObject make(const VString &fullName, const VString &briefName, AttributeInfo info,
             VStatus *ReturnStatus) {
  std::string full = fullName.asUTF8(), brief = briefName.asUTF8();
  if (brief.empty()) brief = full;
  if (!wellFormed(full) || !wellFormed(brief)) {
    report(ReturnStatus,
           VStatus(VStatus::kInvalidParameter,
                   VString("'") + fullName + "' / '" + briefName +
                       "' is not an attribute name: letters, digits and '_', not starting "
                       "with a digit"));
    return VObject();
  }
  VObject object = VObjectFactory::make(VFn::kAttribute, full.c_str());
  info.briefName = brief;
  VObjectFactory::updateAttribute(object, [&info](AttributeInfo &a) { a = info; });
  report(ReturnStatus, VStatus::kSuccess);
  return object;
}

bool read(const VObject &attached, AttributeInfo *info, VStatus *ReturnStatus) {
  bool ok = VObjectFactory::attributeInfo(attached, info);
  report(ReturnStatus, ok ? VStatus(VStatus::kSuccess) : notAttached());
  return ok;
}

VStatus change(const VObject &attached, const std::function<void(AttributeInfo &)> &change) {
  return VObjectFactory::updateAttribute(attached, change) ? VStatus(VStatus::kSuccess)
                                                           : notAttached();
}

}  // namespace attributes

namespace {

template <bool AttributeInfo::*Flag>
bool flag(const VObject &attached, VStatus *ReturnStatus) {
  AttributeInfo info;
  return attributes::read(attached, &info, ReturnStatus) && info.*Flag;
}

template <bool AttributeInfo::*Flag>
VStatus setFlag(const VObject &attached, bool state) {
  return attributes::change(attached, [state](AttributeInfo &a) { a.*Flag = state; });
}

}  // namespace

VFnAttribute::VFnAttribute() = default;

VFnAttribute::VFnAttribute(const VObject &object, VStatus *ReturnStatus) {
  if (object.apiType() != VFn::kAttribute) {
    attributes::report(ReturnStatus,
                       VStatus(VStatus::kInvalidParameter, "The object is not an attribute"));
    return;
  }
  setObject(object);
  attributes::report(ReturnStatus, VStatus::kSuccess);
}

VFnAttribute::~VFnAttribute() = default;

VFn::Type VFnAttribute::type() const { return VFn::kAttribute; }

VString VFnAttribute::name() const { return VObjectFactory::name(object()); }

VString VFnAttribute::shortName() const {
  AttributeInfo info;
  return attributes::read(object(), &info, nullptr) ? VString(info.briefName.c_str()) : VString();
}

bool VFnAttribute::isKeyable(VStatus *s) const {
  return flag<&AttributeInfo::keyable>(object(), s);
}
bool VFnAttribute::isStorable(VStatus *s) const {
  return flag<&AttributeInfo::storable>(object(), s);
}
bool VFnAttribute::isReadable(VStatus *s) const {
  return flag<&AttributeInfo::readable>(object(), s);
}
bool VFnAttribute::isWritable(VStatus *s) const {
  return flag<&AttributeInfo::writable>(object(), s);
}
bool VFnAttribute::isHidden(VStatus *s) const { return flag<&AttributeInfo::hidden>(object(), s); }

VStatus VFnAttribute::setKeyable(bool state) {
  return setFlag<&AttributeInfo::keyable>(object(), state);
}
VStatus VFnAttribute::setStorable(bool state) {
  return setFlag<&AttributeInfo::storable>(object(), state);
}
VStatus VFnAttribute::setReadable(bool state) {
  return setFlag<&AttributeInfo::readable>(object(), state);
}
VStatus VFnAttribute::setWritable(bool state) {
  return setFlag<&AttributeInfo::writable>(object(), state);
}
VStatus VFnAttribute::setHidden(bool state) {
  return setFlag<&AttributeInfo::hidden>(object(), state);
}

const char *VFnAttribute::className() { return "VFnAttribute"; }

OPENVORLA_NAMESPACE_CLOSE
