// VSelectionMask: sets of selection kinds, one bit per kind.
#include <openvorla/VSelectionMask.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

bool valid(VSelectionMask::SelectionType type) {
  return type >= VSelectionMask::kSelectHandles && type < VSelectionMask::kLast;
}

unsigned int bit(VSelectionMask::SelectionType type) { return 1u << type; }

VStatus invalidType() { return VStatus(VStatus::kInvalidParameter, "Not a selection type"); }

}  // namespace

VSelectionMask::VSelectionMask() : fBits(0) {}
VSelectionMask::VSelectionMask(SelectionType type) : fBits(valid(type) ? bit(type) : 0) {}
VSelectionMask::VSelectionMask(const VSelectionMask &other) = default;
VSelectionMask::~VSelectionMask() = default;
VSelectionMask &VSelectionMask::operator=(const VSelectionMask &other) = default;

VStatus VSelectionMask::setMask(SelectionType type) {
  if (!valid(type)) return invalidType();
  fBits = bit(type);
  return VStatus::kSuccess;
}

VStatus VSelectionMask::setMask(const VSelectionMask &mask) {
  fBits = mask.fBits;
  return VStatus::kSuccess;
}

VStatus VSelectionMask::addMask(SelectionType type) {
  if (!valid(type)) return invalidType();
  fBits |= bit(type);
  return VStatus::kSuccess;
}

bool VSelectionMask::intersects(SelectionType type, VStatus *ReturnStatus) const {
  if (!valid(type)) {
    if (ReturnStatus) *ReturnStatus = invalidType();
    return false;
  }
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return (fBits & bit(type)) != 0;
}

bool VSelectionMask::intersects(const VSelectionMask &mask, VStatus *ReturnStatus) const {
  if (ReturnStatus) *ReturnStatus = VStatus::kSuccess;
  return (fBits & mask.fBits) != 0;
}

bool VSelectionMask::isEmpty() const { return fBits == 0; }

VSelectionMask VSelectionMask::operator|(const VSelectionMask &other) const {
  VSelectionMask result(*this);
  result.fBits |= other.fBits;
  return result;
}

bool VSelectionMask::operator==(const VSelectionMask &other) const { return fBits == other.fBits; }
bool VSelectionMask::operator!=(const VSelectionMask &other) const { return fBits != other.fBits; }

OPENVORLA_NAMESPACE_CLOSE
