// VPlug and VPlugArray: plugs and arrays of them.
#include <openvorla/VPlug.h>
#include <openvorla/VPlugArray.h>

#include <standin/Objects.h>

#include <string>

OPENVORLA_NAMESPACE_OPEN

VPlug::VPlug() : fIndex(-1) {}
VPlug::VPlug(const VObject &node, const VObject &attribute)
    : fNode(node), fAttribute(attribute), fIndex(-1) {}
VPlug::VPlug(const VPlug &other) = default;
VPlug::~VPlug() = default;
VPlug &VPlug::operator=(const VPlug &other) = default;

bool VPlug::isNull() const { return fAttribute.isNull(); }
VObject VPlug::node() const { return fNode; }
VObject VPlug::attribute() const { return fAttribute; }
bool VPlug::isElement() const { return fIndex >= 0; }
int VPlug::logicalIndex() const { return fIndex; }

VPlug VPlug::elementByLogicalIndex(unsigned int index, VStatus *ReturnStatus) const {
  if (isNull() || index > 0x7FFFFFFFu) {
    if (ReturnStatus)
      *ReturnStatus = VStatus(VStatus::kInvalidParameter, "No element plug at this index");
    return VPlug();
  }
  VPlug element(*this);
  element.fIndex = static_cast<int>(index);
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return element;
}

VString VPlug::name() const {
  if (isNull()) return VString();
  std::string text =
      std::string(standin::objectName(fNode)) + "." + standin::objectName(fAttribute);
  if (fIndex >= 0) text += "[" + std::to_string(fIndex) + "]";
  return VString(text.c_str());
}

bool VPlug::operator==(const VPlug &o) const {
  return fNode == o.fNode && fAttribute == o.fAttribute && fIndex == o.fIndex;
}
bool VPlug::operator!=(const VPlug &o) const { return !(*this == o); }

VPlugArray::VPlugArray() = default;
VPlugArray::VPlugArray(const VPlugArray &other) = default;
VPlugArray::~VPlugArray() = default;
VPlugArray &VPlugArray::operator=(const VPlugArray &other) = default;

VPlug VPlugArray::operator[](unsigned int index) const { return fPlugs[index]; }

VStatus VPlugArray::set(const VPlug &plug, unsigned int index) {
  if (index >= fPlugs.size()) return VStatus::kInvalidParameter;
  fPlugs[index] = plug;
  return VStatus::kSuccess;
}

VStatus VPlugArray::append(const VPlug &plug) {
  fPlugs.push_back(plug);
  return VStatus::kSuccess;
}

VStatus VPlugArray::remove(unsigned int index) {
  if (index >= fPlugs.size()) return VStatus::kInvalidParameter;
  fPlugs.erase(fPlugs.begin() + index);
  return VStatus::kSuccess;
}

VStatus VPlugArray::clear() {
  fPlugs.clear();
  return VStatus::kSuccess;
}

unsigned int VPlugArray::length() const { return static_cast<unsigned int>(fPlugs.size()); }

OPENVORLA_NAMESPACE_CLOSE
