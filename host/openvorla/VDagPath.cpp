// VDagPath: paths through the scene hierarchy.
#include <openvorla/VDagPath.h>

#include <standin/Objects.h>

OPENVORLA_NAMESPACE_OPEN

namespace {

VStatus emptyPath() { return VStatus(VStatus::kInvalidParameter, "The path is empty"); }

template <typename T>
T answer(VStatus *ReturnStatus, bool ok, T value) {
  if (ReturnStatus) *ReturnStatus = ok ? VStatus(VStatus::kSuccess) : emptyPath();
  return value;
}

}  // namespace

VDagPath::VDagPath() = default;
VDagPath::VDagPath(const VDagPath &other) = default;
VDagPath::~VDagPath() = default;
VDagPath &VDagPath::operator=(const VDagPath &other) = default;

VStatus VDagPath::push(const VObject &child) {
  if (child.isNull()) return VStatus(VStatus::kInvalidParameter, "A path holds no null object");
  fNodes.push_back(child);
  return VStatus::kSuccess;
}

VStatus VDagPath::pop(unsigned int count) {
  if (count > fNodes.size())
    return VStatus(VStatus::kInvalidParameter, "The path is shorter than that");
  fNodes.resize(fNodes.size() - count);
  return VStatus::kSuccess;
}

bool VDagPath::isValid() const { return !fNodes.empty(); }
unsigned int VDagPath::length() const { return static_cast<unsigned int>(fNodes.size()); }

VObject VDagPath::node(VStatus *ReturnStatus) const {
  return answer(ReturnStatus, isValid(), isValid() ? fNodes.back() : VObject());
}

VString VDagPath::fullPathName(VStatus *ReturnStatus) const {
  VString name;
  for (const VObject &node : fNodes) name += VString("|") + standin::objectName(node);
  return answer(ReturnStatus, isValid(), name);
}

VString VDagPath::partialPathName(VStatus *ReturnStatus) const {
  return answer(ReturnStatus, isValid(),
                VString(isValid() ? standin::objectName(fNodes.back()) : ""));
}

bool VDagPath::operator==(const VDagPath &other) const { return fNodes == other.fNodes; }
bool VDagPath::operator!=(const VDagPath &other) const { return !(*this == other); }

OPENVORLA_NAMESPACE_CLOSE
